#include "tools/check/medium_files.h"

#include <algorithm>
#include <filesystem>
#include <sstream>
#include <system_error>
#include <utility>

#include "base/ascii.h"
#include "base/text.h"
#include "media/medium.h"
#include "platform/freedesktop/strings_table.h"
#include "platform/posix/file.h"
#include "platform/property_list.h"
#include "tools/check/spelling.h"
#include "tools/check/unreadable.h"

namespace onramp::check {

namespace {

namespace fs = std::filesystem;

std::vector<std::string> namesIn(const std::string& folder) {
  std::vector<std::string> names;
  std::error_code error;
  fs::directory_iterator entry(folder, error);
  for (; !error && entry != fs::directory_iterator(); entry.increment(error))
    names.push_back(entry->path().filename().string());
  std::sort(names.begin(), names.end());
  return names;
}

// Returns the components of a relative path with "." and ".." resolved. Returns nothing when the
// path leads outside its starting folder.
std::optional<std::vector<std::string>> components(const std::string& path) {
  std::vector<std::string> parts;
  for (const fs::path& part : fs::path(path)) {
    if (part == ".." && parts.empty()) return std::nullopt;
    if (part == "..") {
      parts.pop_back();
    } else if (!part.empty() && part != "." && part != "/") {
      parts.push_back(part.string());
    }
  }
  return parts;
}

std::string inFolder(const std::string& folder, const std::string& name) {
  return folder.empty() ? name : folder + "/" + name;
}

bool isInside(const std::string& path, const std::string& root) {
  std::error_code error;
  const fs::path real = fs::canonical(path, error);
  if (error) return true;  // there is no file; exists() reports that
  const fs::path realRoot = fs::canonical(root, error);
  return error || std::mismatch(realRoot.begin(), realRoot.end(), real.begin(), real.end()).first ==
                      realRoot.end();
}

// Returns the number of the first line in the strings table at `path` that begins with `key` in
// quotation marks, after any spaces and tabs. Returns nothing when there is no such line.
std::optional<std::size_t> lineOfString(const std::string& path, const std::string& key) {
  const auto bytes = posix::readFile(path, kMostPropertyListBytes);
  std::istringstream text(bytes ? decodedText(*bytes).value_or("") : "");
  std::string line;
  for (std::size_t number = 1; std::getline(text, line); ++number) {
    const std::size_t start = std::min(line.find_first_not_of(" \t"), line.size());
    if (line.compare(start, key.size() + 2, quoted(key)) == 0) return number;
  }
  return std::nullopt;
}

// Returns the path, relative to `root`, of the only file or folder named `name` anywhere in `root`.
// Returns nothing if there is no such path, if there are several, or if `root` has so many files
// that the search would take too long.
std::optional<std::string> onlyPathOf(const std::string& name, const std::string& root) {
  constexpr int kMostFiles = 10'000;
  std::optional<std::string> only;
  std::error_code error;
  fs::recursive_directory_iterator entry(root, error);
  for (int files = 0; !error && entry != fs::recursive_directory_iterator();
       entry.increment(error)) {
    if (++files > kMostFiles) return std::nullopt;
    if (entry->path().filename() != name) continue;
    if (only) return std::nullopt;
    only = entry->path().lexically_relative(root).string();
  }
  return only;
}

// `nearest` is a name on the medium that resembles `missing`, if there is one. `isWritten` is true
// if a file on the medium names `missing`, and false if the path is fixed in the wizard.
std::string remedyForMissing(const std::string& missing, const std::optional<std::string>& nearest,
                             bool isWritten) {
  if (!nearest)
    return isWritten ? "put it at that path, or correct the path" : "put it at that path";
  const std::string rename = "rename " + quoted(*nearest) + " to " + quoted(missing);
  return "put it at that path, or " + rename +
         (isWritten ? ", or write " + quoted(*nearest) : std::string());
}

}  // namespace

MediumFiles::MediumFiles(std::string root, std::string application, Report& report)
    : root_(std::move(root)), application_(std::move(application)), report_(report) {}

std::string MediumFiles::fullPath(const std::string& relative) const {
  return medium::fullPath(application_, relative);
}

std::vector<std::string> MediumFiles::names(const std::string& relative) const {
  return namesIn(root_ + "/" + relative);
}

bool MediumFiles::exists(const std::string& relative, const PathUse& use) const {
  Finding finding{.id = "path-outside", .place = use.place, .effect = use.effect};
  const auto parts = components(relative);
  std::error_code ignored;
  const bool isElsewhere = relative.starts_with('/') && fs::exists(relative, ignored) &&
                           !fs::exists(fullPath(relative), ignored);
  if (isElsewhere) {
    finding.found = use.what + " at " + quoted(relative) + ", which is a path on this computer";
    finding.expected = "a path from the medium's top";
    finding.remedy = "put the file on the medium and write its path from the medium's top";
    if (relative.starts_with(root_ + "/")) finding.nearest = relative.substr(root_.size() + 1);
    report_.findings.push_back(std::move(finding));
    return false;
  }
  if (!parts || !isInside(fullPath(relative), root_)) {
    finding.found = use.what + " at " + quoted(relative) + ", which leads outside the medium";
    finding.expected = "a path inside the medium";
    finding.remedy = "put the file on the medium and write its path from the medium's top";
    finding.effect = "on a computer that lacks this file, " + use.effect;
    report_.findings.push_back(std::move(finding));
    return false;
  }
  std::string folder;
  for (const std::string& part : *parts) {
    const std::vector<std::string> there = names(folder);
    if (!std::binary_search(there.begin(), there.end(), part)) {
      reportMissing(relative, folder, part, use);
      return false;
    }
    folder = inFolder(folder, part);
    used_.insert(folder);
  }
  return true;
}

void MediumFiles::reportMissing(const std::string& relative, const std::string& folder,
                                const std::string& part, const PathUse& use) const {
  const std::vector<std::string> there = names(folder);
  const auto sameStem = std::find_if(there.begin(), there.end(), [&](const std::string& name) {
    return fs::path(name).stem() == part;
  });
  const auto nearest =
      sameStem == there.end() ? Spelling(there).nearest(part) : std::optional(*sameStem);
  const bool capitals = nearest && asciiLowercased(*nearest) == asciiLowercased(part);
  Finding finding{.id = capitals ? "path-capitals" : "path-missing",
                  .place = use.place,
                  .found = use.what + " at " + quoted(relative) +
                           (capitals ? ", which differs from the name on the medium only in "
                                       "capital letters"
                                     : ", which does not exist"),
                  .expected = quoted(part) +
                              (folder.empty() ? " at the medium's top" : " in " + quoted(folder)),
                  .nearest = nearest.value_or(""),
                  .effect = use.effect,
                  .remedy = remedyForMissing(part, nearest, !use.place.key.empty())};
  if (nearest) {
    guesses_.push_back({report_.findings.size(), inFolder(folder, *nearest), part});
  } else if (const auto only = onlyPathOf(fs::path(relative).filename().string(), root_)) {
    finding.found += "; the medium has " + quoted(*only);
  }
  report_.findings.push_back(std::move(finding));
}

void MediumFiles::reportUnreadable(const std::string& relative, const PathUse& use,
                                   bool isStrings) const {
  Finding finding{.id = isStrings ? "strings-unreadable" : "list-unreadable",
                  .place = {.file = relative},
                  .effect = use.effect};
  explainUnreadable(fullPath(relative), isStrings, finding);
  report_.findings.push_back(std::move(finding));
}

std::optional<Dictionary> MediumFiles::list(const std::string& relative, const PathUse& use) const {
  if (!exists(relative, use)) return std::nullopt;
  auto list = loadDictionary(fullPath(relative));
  if (!list) {
    reportUnreadable(relative, use, false);
    return list;
  }
  for (const auto& [key, line] : linesOf(relative).twice) {
    report_.findings.push_back(
        {.id = "key-twice",
         .place = {.file = relative, .key = key, .line = line},
         .found = "a key that its dictionary already has",
         .expected = "every key once",
         .effect = "the wizard uses one of the two values; which one depends on the system",
         .remedy = "remove one of the two"});
  }
  return list;
}

const XMLLines& MediumFiles::linesOf(const std::string& relative) const {
  const auto known = lines_.find(relative);
  if (known != lines_.end()) return known->second;
  const auto bytes = posix::readFile(fullPath(relative), kMostPropertyListBytes);
  const auto text = bytes ? decodedText(*bytes) : std::nullopt;
  return lines_.emplace(relative, text && isXML(*text) ? xmlLines(*text) : XMLLines())
      .first->second;
}

std::optional<Dictionary> MediumFiles::strings(const std::string& relative,
                                               const PathUse& use) const {
  if (!exists(relative, use)) return std::nullopt;
  auto table = loadStringsTable(fullPath(relative));
  if (!table) reportUnreadable(relative, use, true);
  return table;
}

void MediumFiles::withdrawUsedNames() const {
  for (const Guess& guess : guesses_) {
    Finding& finding = report_.findings[guess.finding];
    if (finding.id != "path-missing" || !used_.contains(guess.path)) continue;
    finding.nearest.clear();
    finding.remedy = remedyForMissing(guess.missing, std::nullopt, !finding.place.key.empty());
  }
}

void MediumFiles::addLines() const {
  for (Finding& finding : report_.findings) {
    Place& place = finding.place;
    if (place.line || place.key.empty()) continue;
    if (place.file.ends_with(".strings"))
      place.line = lineOfString(fullPath(place.file), place.key.front());
    if (!place.file.ends_with(".plist")) continue;
    const XMLLines& lines = linesOf(place.file);
    const auto line = lines.keys.find(place.key);
    if (line != lines.keys.end()) place.line = line->second;
  }
}

}  // namespace onramp::check

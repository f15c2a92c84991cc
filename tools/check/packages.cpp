#include <algorithm>
#include <array>
#include <filesystem>
#include <iterator>
#include <set>
#include <system_error>

#include "base/ascii.h"
#include "media/KSInstallerInfo.h"
#include "media/medium.h"
#include "media/system_range.h"
#include "platform/standin/stand_in_system.h"
#include "platform/system_version.h"
#include "tools/check/checks.h"
#include "tools/check/key_rules.h"

namespace onramp::check {

namespace {

using Version = std::array<std::int64_t, 3>;

// Returns the first releases of 10.0 to 10.16, and 11.0. The wizard's choice of a package changes
// at no other version.
std::set<Version> differentSystems() {
  constexpr std::int64_t kLastMinor = 16;
  std::set<Version> systems{{11, 0, 0}};
  for (std::int64_t minor = 0; minor <= kLastMinor; ++minor)
    systems.insert({10, minor, 0});
  return systems;
}

SystemVersion systemOf(const Version& version) {
  return {version[0], version[1], version[2]};
}

bool isVersionNumber(const std::string& text) {
  return !text.empty() && std::all_of(text.begin(), text.end(), isASCIIDigit);
}

std::string dotted(const Version& version) {
  const std::string text = std::to_string(version[0]) + "." + std::to_string(version[1]);
  return version[2] == 0 && version[1] == 0 ? text : text + "." + std::to_string(version[2]);
}

Version boundOf(const Dictionary& bound) {
  return {bound.integerValue("Major"), bound.integerValue("Minor"), bound.integerValue("BugFix")};
}

// Makes `version` the system's version. Returns the key under which the wizard then looks for the
// package, or an empty string when there is none.
std::string versionKey(const Version& version) {
  setSystemVersion(std::to_string(version[0]) + "." + std::to_string(version[1]) + "." +
                   std::to_string(version[2]));
  return std::string(packageKey(gestaltSystemVersion().value_or(0)).value_or(""));
}

// Returns how to write a maximum that includes all of the major version `major`.
std::string supportAllOf(std::int64_t major) {
  return "to support all of " + std::to_string(major) + ", write " + std::to_string(major + 1) +
         ", 0, 0";
}

bool takesAllBugFixes(const Dictionary& maximum) {
  Version beyond = boundOf(maximum);
  beyond[2] = INT64_MAX;
  return !isNewerThan(maximum, systemOf(beyond));
}

class PackageCheck {
 public:
  PackageCheck(const MediumFiles& files, const Lists& lists)
      : files_(files), lists_(lists), report_(files.report()) {
    info_.setCDCommonInfoValue(lists.resources);
  }

  void run() {
    describeRange();
    checkNumbers(medium::kSystemMin, info_.supportSystemMin());
    checkNumbers(medium::kSystemMax, info_.supportSystemMax());
    checkEmptyRange();
    checkNamedMaximum();
    checkFirstMinorVersion();
    checkApplicationsOwnMinimum();
    if (!lists_.resources->dictionary(medium::kPkgInfo)) return;
    findPackages();
    checkKeysThatNobodyUses();
  }

 private:
  [[nodiscard]] Place placeOf(std::string_view dictionary, std::string_view key = "") const {
    Place place{.file = lists_.resourcesPath, .key = {std::string(dictionary)}};
    if (!key.empty()) place.key.emplace_back(key);
    return place;
  }

  [[nodiscard]] bool isSupported(const Version& version) const {
    return systemSupport(systemOf(version), info_.supportSystemMin(), info_.supportSystemMax()) ==
           SystemSupport::kSupported;
  }

  // Returns the first version above the range. Returns nothing when the range has no upper bound.
  [[nodiscard]] std::optional<Version> end() const {
    const Dictionary& maximum = info_.supportSystemMax();
    if (!isBound(maximum)) return std::nullopt;
    Version end = boundOf(maximum);
    if (takesAllBugFixes(maximum)) end = {end[0], end[1] + 1, 0};
    return end;
  }

  [[nodiscard]] Version begin() const {
    const Dictionary& minimum = info_.supportSystemMin();
    return isBound(minimum) ? boundOf(minimum) : Version{};
  }

  // Returns the range from `from` to `to` in words, such as "10.13.0 up to, but not including,
  // 13.0". Without `to`, the range has no upper bound.
  [[nodiscard]] std::string words(const Version& from, const std::optional<Version>& to) const {
    const std::string first = from == Version{} ? "" : dotted(from);
    if (!to) return first.empty() ? "every system" : first + " and later";
    const Dictionary& maximum = info_.supportSystemMax();
    const bool isEnd = to == end() && takesAllBugFixes(maximum);
    const Version last = boundOf(maximum);
    const std::string until =
        isEnd ? "up to the last " + std::to_string(last[0]) + "." + std::to_string(last[1]) + ".x"
              : "up to, but not including, " + dotted(*to);
    return first.empty() ? until : first + " " + until;
  }

  void describeRange() { report_.systems = words(begin(), end()); }

  void checkNumbers(std::string_view which, const Dictionary& bound) {
    constexpr std::int64_t kNewestMajor = 1000;
    const std::int64_t major = bound.integerValue("Major");
    const bool isMajor = major > 0 && major < kNewestMajor;
    for (const char* const key : {"Major", "Minor", "BugFix"}) {
      const auto text = bound.string(key);
      if (!text) continue;
      const bool every = which == medium::kSystemMax && key == std::string_view("BugFix") &&
                         asciiLowercased(*text) == "x";
      if (isVersionNumber(*text) || every) continue;
      report_.findings.push_back(
          {.id = "version-number",
           .place = placeOf(which, key),
           .found = "the string " + quoted(*text),
           .expected = which == medium::kSystemMax && key == std::string_view("BugFix")
                           ? "a number, or \"x\" for all of that minor version"
                           : "a number",
           .effect = "the value counts as " + std::to_string(leadingInteger(*text)),
           .remedy = which == medium::kSystemMax && key == std::string_view("Minor") && isMajor
                         ? supportAllOf(major) + "; otherwise, write a number"
                         : "write a number"});
    }
  }

  void checkEmptyRange() {
    if (!isBound(info_.supportSystemMax())) return;
    if (isSupported(begin())) return;
    report_.findings.push_back({.id = "range-empty",
                                .place = placeOf(medium::kSystemMax),
                                .found = "a range that contains no system: " + report_.systems,
                                .expected = "a maximum later than the minimum",
                                .effect = "every system is refused",
                                .remedy = "correct \"SystemMin\" or \"SystemMax\""});
  }

  // Warns when the maximum's "BugFix" is a number, because the wizard refuses the release with that
  // number. Does not warn when that release is the first of a major version, because this is the
  // usual way to exclude the whole version.
  void checkNamedMaximum() {
    const Dictionary& maximum = info_.supportSystemMax();
    const auto text = maximum.string("BugFix");
    const bool written = text ? isVersionNumber(*text) : maximum.find("BugFix") != nullptr;
    if (!isBound(maximum) || !written || takesAllBugFixes(maximum)) return;
    const Version named = boundOf(maximum);
    if ((named[1] == 0 && named[2] == 0) || !isSupported(begin())) return;
    const std::string name = dotted(named);
    report_.findings.push_back(
        {.id = "range-excludes-maximum",
         .severity = Severity::kWarning,
         .place = placeOf(medium::kSystemMax, "BugFix"),
         .found = "the supported systems: " + report_.systems,
         .expected = "\"x\" for \"BugFix\" to accept all of " + std::to_string(named[0]) + "." +
                     std::to_string(named[1]) + ", or the first release that is refused",
         .effect = name + " itself is refused as too new",
         .remedy = "keep this only if " + name + " is meant to be refused"});
  }

  // Warns when the range begins with an earlier version and ends with the first minor version of
  // macOS 11 or later. Before macOS 11, each yearly release was a minor version, so there a range
  // may well end with one.
  void checkFirstMinorVersion() {
    constexpr std::int64_t kFirstYearlyMajor = 11;
    const Dictionary& maximum = info_.supportSystemMax();
    const Version last = boundOf(maximum);
    const Value* const minor = maximum.find("Minor");
    const auto text = maximum.string("Minor");
    const bool isNumber = text ? isVersionNumber(*text) : minor && !minor->boolean();
    if (!isBound(maximum) || !takesAllBugFixes(maximum) || !isNumber || !isSupported(begin()) ||
        last[0] < kFirstYearlyMajor || last[1] != 0 || begin()[0] == last[0]) {
      return;
    }
    const std::string major = std::to_string(last[0]);
    report_.findings.push_back({.id = "range-stops-at-minor",
                                .severity = Severity::kWarning,
                                .place = placeOf(medium::kSystemMax, "Minor"),
                                .found = "the supported systems: " + report_.systems,
                                .expected = "a range to the last release of macOS " + major,
                                .effect = major + ".1 is refused as too new",
                                .remedy = supportAllOf(last[0]) + "; otherwise, keep it"});
  }

  void checkApplicationsOwnMinimum() {
    constexpr const char* kKey = "LSMinimumSystemVersion";
    const auto own = lists_.information ? lists_.information->string(kKey) : std::nullopt;
    if (!own || !isSupported(begin())) return;
    const std::size_t point = std::min(own->find('.'), own->size());
    const SystemVersion oldest =
        systemVersion({own->substr(0, point), own->substr(std::min(point + 1, own->size()))});
    const Dictionary& maximum = info_.supportSystemMax();
    if (!isBound(maximum) || !isNewerThan(maximum, oldest)) return;
    report_.findings.push_back(
        {.id = "range-before-application",
         .place = {.file = lists_.informationPath, .key = {kKey}},
         .found = "an application for " + *own + " and later",
         .expected = "an application that starts on the supported systems: " + report_.systems,
         .effect = "the wizard starts on none of the systems that the medium supports",
         .remedy = "widen the range with \"SystemMax\""});
  }

  // Returns the package that the wizard opens on `version`, as a path from the medium's top folder.
  // Returns an empty string when no package opens.
  [[nodiscard]] std::string packageFor(const Version& version) {
    usedKeys_.insert(versionKey(version));
    info_.loadPkgURL(lists_.resources);
    const std::optional<FileURL>& url = info_.pkgURL();
    return url ? url->path.substr(files_.fullPath("").size() + 1) : std::string();
  }

  void findPackages() {
    std::set<Version> starts = differentSystems();
    for (const Version& system : starts)
      knownKeys_.insert(versionKey(system));
    starts.insert(begin());
    if (const auto last = end()) starts.insert(*last);
    for (auto start = starts.begin(); start != starts.end(); ++start) {
      const auto next = std::next(start);
      if (!isSupported(*start)) continue;
      const std::string package = packageFor(*start);
      const auto to = next == starts.end() ? std::nullopt : std::optional(*next);
      if (!rows_.empty() && rows_.back().package == package) {
        rows_.back().to = to;
      } else {
        rows_.push_back({*start, to, package});
      }
    }
    for (const Row& row : rows_) {
      report_.packages.push_back({words(row.from, row.to), row.package});
      checkPackage(row);
    }
  }

  struct Row {
    Version from;
    std::optional<Version> to;
    std::string package;
  };

  void checkPackage(const Row& row) {
    const Dictionary package = *lists_.resources->dictionary(medium::kPkgInfo);
    const std::string key = package.find("PkgName") ? "PkgName" : versionKey(row.from);
    const std::string effect =
        "the window closes and nothing opens; systems: " + words(row.from, row.to);
    if (package.string(key) == "") {
      report_.findings.push_back({.id = "package-unnamed",
                                  .place = placeOf(medium::kPkgInfo, key),
                                  .found = "an empty name",
                                  .expected = "the package's name",
                                  .effect = effect,
                                  .remedy = "name the package"});
      return;
    }
    if (!row.package.empty()) {
      const PathUse use{placeOf(medium::kPkgInfo, key), "the package", effect};
      if (checked_.insert(row.package).second && files_.exists(row.package, use))
        checkContents(row.package, use);
      return;
    }
    // readLists() has already reported a value of the wrong kind and a missing "PkgLocation".
    if (package.find(key) || !package.string("PkgLocation")) return;
    report_.findings.push_back(
        {.id = "package-none",
         .place = placeOf(medium::kPkgInfo),
         .found = "no package for these systems: " + words(row.from, row.to),
         .expected = key.empty() ? "\"PkgName\"" : "\"PkgName\" or " + quoted(key),
         .effect = "the window closes and nothing opens on these systems",
         .remedy = "name the package, or narrow the range of systems"});
  }

  void checkContents(const std::string& package, const PathUse& use) {
    std::error_code error;
    if (!std::filesystem::is_empty(files_.fullPath(package), error) || error) return;
    report_.findings.push_back({.id = "package-empty",
                                .place = use.place,
                                .found = "an empty package at " + quoted(package),
                                .expected = "an installer package",
                                .effect = "nothing can be installed",
                                .remedy = "put the finished package there"});
  }

  void checkKeysThatNobodyUses() {
    const Dictionary package = *lists_.resources->dictionary(medium::kPkgInfo);
    std::string shadowed;
    for (const auto& [key, value] : package) {
      if (!isVersionNumber(key)) continue;
      if (!knownKeys_.contains(key)) {
        neverUsed(key);
      } else if (package.find("PkgName")) {
        shadowed += (shadowed.empty() ? "" : ", ") + quoted(key);
      } else if (!usedKeys_.contains(key)) {
        unsupported(key);
      }
    }
    if (shadowed.empty()) return;
    report_.findings.push_back(
        {.id = "package-shadowed",
         .place = placeOf(medium::kPkgInfo, "PkgName"),
         .found = "\"PkgName\" beside " + shadowed,
         .expected = "either \"PkgName\" or packages by version",
         .effect = "every system gets " + quoted(package.string("PkgName").value_or("")),
         .remedy = "remove \"PkgName\", or the keys that it takes precedence over"});
  }

  void neverUsed(const std::string& key) {
    report_.findings.push_back(
        {.id = "package-key-unknown",
         .place = placeOf(medium::kPkgInfo, key),
         .found = "a key that no system uses",
         .expected = "\"104\" to \"109\"",
         .effect = "10.9 and every later system get the package that \"109\" names",
         .remedy = lists_.resources->dictionary(medium::kPkgInfo)->find("109")
                       ? "remove the key; a distribution package can choose by the system's version"
                       : "move the name to \"109\", or remove the key"});
  }

  void unsupported(const std::string& key) {
    report_.findings.push_back({.id = "package-key-unused",
                                .severity = Severity::kWarning,
                                .place = placeOf(medium::kPkgInfo, key),
                                .found = "a key for systems outside the supported range",
                                .expected = "packages for " + report_.systems,
                                .effect = "the package that the key names never opens",
                                .remedy = "remove the key, or widen the range"});
  }

  const MediumFiles& files_;
  const Lists& lists_;
  Report& report_;
  KSInstallerInfo info_;
  std::vector<Row> rows_;
  std::set<std::string> knownKeys_;
  std::set<std::string> usedKeys_;  ///< keys that supported systems use
  std::set<std::string> checked_;
};

}  // namespace

void checkPackages(const MediumFiles& files, const Lists& lists) {
  if (lists.resources) PackageCheck(files, lists).run();
}

}  // namespace onramp::check

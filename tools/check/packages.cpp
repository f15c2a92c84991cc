#include <algorithm>
#include <array>
#include <filesystem>
#include <iterator>
#include <set>
#include <system_error>
#include <utility>

#include "media/KSInstallerInfo.h"
#include "media/medium.h"
#include "platform/standin/stand_in_system.h"
#include "platform/system_version.h"
#include "tools/check/checks.h"
#include "tools/check/key_rules.h"
#include "tools/check/supported_range.h"

namespace onramp::check {

namespace {

// Returns the first releases of 10.0 to 10.16, and 11.0. The wizard's choice of a package changes
// at no other version below 101. From 101 on, no version key applies.
std::set<Version> differentSystems() {
  constexpr std::int64_t kLastMinor = 16;
  std::set<Version> systems{{11, 0, 0}};
  for (std::int64_t minor = 0; minor <= kLastMinor; ++minor)
    systems.insert({10, minor, 0});
  return systems;
}

// Sets the stand-in system's version to `version`. Returns the key under which the wizard then
// looks for the package, or an empty string when there is none.
std::string versionKey(const Version& version) {
  setSystemVersion(std::to_string(version[0]) + "." + std::to_string(version[1]) + "." +
                   std::to_string(version[2]));
  return std::string(packageKey(gestaltSystemVersion().value_or(0)).value_or(""));
}

class PackageCheck {
 public:
  PackageCheck(const MediumFiles& files, const Lists& lists, Dictionary packages)
      : files_(files),
        lists_(lists),
        packages_(std::move(packages)),
        report_(files.report()),
        range_(lists) {
    info_.setCDCommonInfoValue(lists.resources);
  }

  void run() {
    findPackages();
    checkKeysThatNobodyUses();
  }

 private:
  // Returns the package that the wizard opens on `version`, as a path from the medium's top folder.
  // Returns an empty string when no package opens.
  [[nodiscard]] std::string packageFor(const Version& version) {
    usedKeys_.insert(versionKey(version));
    info_.loadPkgURL(lists_.resources);
    const std::optional<FileURL>& url = info_.pkgURL();
    if (!url) return "";
    // Without a folder and a name, the path is that of the medium itself.
    return url->path.substr(std::min(files_.fullPath("").size() + 1, url->path.size()));
  }

  void findPackages() {
    std::set<Version> starts = differentSystems();
    for (const Version& system : starts)
      knownKeys_.insert(versionKey(system));
    starts.insert(range_.begin());
    if (const auto last = range_.end()) starts.insert(*last);
    for (auto start = starts.begin(); start != starts.end(); ++start) {
      const auto next = std::next(start);
      if (!range_.contains(*start)) continue;
      const std::string package = packageFor(*start);
      const auto to = next == starts.end() ? std::nullopt : std::optional(*next);
      if (!rows_.empty() && rows_.back().package == package) {
        rows_.back().to = to;
      } else {
        rows_.push_back({*start, to, package});
      }
    }
    for (const Row& row : rows_)
      report_.packages.push_back({range_.words(row.from, row.to), row.package});
    if (!hasFolder()) return;
    for (const Row& row : rows_)
      checkPackage(row);
  }

  struct Row {
    Version from;
    std::optional<Version> to;
    std::string package;
  };

  // Returns whether the packages' folder exists, and reports a missing one. Returns true when
  // "PkgInfo" names no folder.
  [[nodiscard]] bool hasFolder() const {
    const auto folder = packages_.string("PkgLocation");
    return !folder ||
           files_.exists(*folder, {lists_.resourcePlace(medium::kPkgInfo, "PkgLocation"),
                                   "the packages' folder", "the window closes and nothing opens"});
  }

  void checkPackage(const Row& row) {
    const std::string key = packages_.find("PkgName") ? "PkgName" : versionKey(row.from);
    const std::string effect =
        "the window closes and nothing opens; systems: " + range_.words(row.from, row.to);
    if (packages_.string(key) == "") {
      report_.findings.push_back({.id = "package-unnamed",
                                  .place = lists_.resourcePlace(medium::kPkgInfo, key),
                                  .found = "an empty name",
                                  .expected = "the package's name",
                                  .effect = effect,
                                  .remedy = "name the package"});
      return;
    }
    if (!row.package.empty()) {
      const PathUse use{lists_.resourcePlace(medium::kPkgInfo, key), "the package", effect};
      if (checked_.insert(row.package).second && files_.exists(row.package, use))
        checkContents(row.package, use);
      return;
    }
    // readLists() has already reported a value of the wrong kind and a missing "PkgLocation".
    if (packages_.find(key) || !packages_.string("PkgLocation")) return;
    report_.findings.push_back(
        {.id = "package-none",
         .place = lists_.resourcePlace(medium::kPkgInfo),
         .found = "no package for these systems: " + range_.words(row.from, row.to),
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
    std::string shadowed;
    for (const auto& [key, value] : packages_) {
      if (!isVersionNumber(key)) continue;
      if (!knownKeys_.contains(key)) {
        neverUsed(key);
      } else if (packages_.find("PkgName")) {
        shadowed += (shadowed.empty() ? "" : ", ") + quoted(key);
      } else if (!usedKeys_.contains(key)) {
        unsupported(key);
      }
    }
    if (shadowed.empty()) return;
    report_.findings.push_back(
        {.id = "package-shadowed",
         .place = lists_.resourcePlace(medium::kPkgInfo, "PkgName"),
         .found = "\"PkgName\" beside " + shadowed,
         .expected = "either \"PkgName\" or packages by version",
         .effect = "every system gets " + quoted(packages_.string("PkgName").value_or("")),
         .remedy = "remove \"PkgName\", or the keys that it takes precedence over"});
  }

  void neverUsed(const std::string& key) {
    report_.findings.push_back(
        {.id = "package-key-unknown",
         .place = lists_.resourcePlace(medium::kPkgInfo, key),
         .found = "a key that no system uses",
         .expected = "\"104\" to \"109\"",
         .effect = "10.9 and every later system get the package that \"109\" names",
         .remedy = packages_.find("109")
                       ? "remove the key; a distribution package can choose by the system's version"
                       : "move the name to \"109\", or remove the key"});
  }

  // Returns whether the application starts on any system that uses the package key `key`. The key
  // "109" serves every system from 10.9 on.
  [[nodiscard]] bool isForApplication(const std::string& key) const {
    const auto oldest = applicationsMinimum(lists_);
    return !oldest || key == "109" ||
           (oldest->major == 10 && std::to_string(100 + oldest->minor) <= key);
  }

  void unsupported(const std::string& key) {
    report_.findings.push_back({.id = "package-key-unused",
                                .severity = Severity::kWarning,
                                .place = lists_.resourcePlace(medium::kPkgInfo, key),
                                .found = "a key for systems outside the supported range",
                                .expected = "packages for " + report_.systems,
                                .effect = "the package that the key names never opens",
                                .remedy = isForApplication(key)
                                              ? "remove the key, or widen the range"
                                              : "remove the key; the application does not start on "
                                                "its systems"});
  }

  const MediumFiles& files_;
  const Lists& lists_;
  const Dictionary packages_;  ///< the dictionary under "PkgInfo"
  Report& report_;
  SupportedRange range_;
  KSInstallerInfo info_;
  std::vector<Row> rows_;
  std::set<std::string> knownKeys_;
  std::set<std::string> usedKeys_;  ///< keys that supported systems use
  std::set<std::string> checked_;   ///< packages that were looked for
};

}  // namespace

void checkPackages(const MediumFiles& files, const Lists& lists) {
  if (!lists.resources) return;
  if (const auto packages = lists.resources->dictionary(medium::kPkgInfo))
    PackageCheck(files, lists, *packages).run();
}

}  // namespace onramp::check

#include "media/KSInstallerInfo.h"

#include <array>

#include "media/medium.h"
#include "platform/system_version.h"

namespace onramp {

namespace {

std::optional<std::string> packageName(const Dictionary& pkg) {
  // A "PkgName" that is not a string names no package, but it still takes precedence over the
  // version keys.
  if (pkg.find("PkgName")) return pkg.string("PkgName");
  const auto key = packageKey(gestaltSystemVersion().value_or(0));
  return key ? pkg.string(*key) : std::nullopt;
}

}  // namespace

std::optional<std::string_view> packageKey(std::int32_t version) {
  struct Rule {
    std::int32_t atLeast;
    std::string_view key;
  };
  static constexpr std::array<Rule, 6> kRules{{{0x1090, "109"},
                                               {0x1080, "108"},
                                               {0x1070, "107"},
                                               {0x1060, "106"},
                                               {0x1050, "105"},
                                               {0x1040, "104"}}};
  if (version > 0x100FF) return std::nullopt;
  for (const Rule& rule : kRules) {
    if (version >= rule.atLeast) return rule.key;
  }
  return std::nullopt;
}

KSInstallerInfo::KSInstallerInfo() {
  setCDCommonInfoValue(medium::loadResourceDictionary());
}

void KSInstallerInfo::setCDCommonInfoValue(const std::optional<Dictionary>& common) {
  loadWLANToolURL(common);
  loadSupportSystem(common);
  loadPkgURL(common);
}

void KSInstallerInfo::loadPkgURL(const std::optional<Dictionary>& common) {
  mPkgURL.reset();
  const auto pkg = common ? common->dictionary(medium::kPkgInfo) : std::nullopt;
  if (!pkg) return;
  const auto name = packageName(*pkg);
  const auto location = pkg->string("PkgLocation");
  if (!name || !location) return;
  mPkgURL =
      FileURL{medium::withoutClosingSlash(convertRelativePathToFullPath(location) + "/" + *name)};
}

void KSInstallerInfo::loadSupportSystem(const std::optional<Dictionary>& common) {
  const Dictionary unbounded{{"Major", "0"}, {"Minor", "0"}, {"BugFix", "0"}};
  const Dictionary given = common.value_or(Dictionary());
  mSystemMin = given.dictionary(medium::kSystemMin).value_or(unbounded);
  mSystemMax = given.dictionary(medium::kSystemMax).value_or(unbounded);
}

void KSInstallerInfo::loadWLANToolURL(const std::optional<Dictionary>& common) {
  mWLANToolURL.reset();
  if (common) {
    mWLANToolURL = FileURL{convertRelativePathToFullPath(common->string(medium::kWLANtool))};
  }
}

std::string KSInstallerInfo::convertRelativePathToFullPath(
    const std::optional<std::string>& relativePath) {
  return medium::fullPath(relativePath);
}

}  // namespace onramp

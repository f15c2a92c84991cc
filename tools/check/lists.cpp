#include "tools/check/lists.h"

#include <algorithm>
#include <array>
#include <filesystem>
#include <system_error>

#include "base/ascii.h"
#include "media/KSOROSXCD.h"
#include "media/connection_type.h"
#include "media/medium.h"

namespace onramp::check {

namespace {

constexpr const char* kPackageAtOnce =
    "every model counts as one without wireless, so the package opens at once, without any page";
constexpr const char* kNothing = "the wizard quits at once, without any page, and no package opens";
constexpr const char* kNoModels =
    "the medium has no models, so the package opens at once, without any page";
constexpr const char* kNoPackage = "nothing opens when the wizard quits";
constexpr const char* kNoVersionPackage = "nothing opens on the systems that use this key";

constexpr std::array kInformationRules{
    KeyRule{"CommonResourcePath", Kind::kPath, Need::kRequired, kNothing},
    KeyRule{"CFBundleName", Kind::kText, Need::kAdvised, "a window without a title"},
};

constexpr std::array kResourceRules{
    KeyRule{medium::kBonjourNetwork, Kind::kText, Need::kOptional,
            "no device is ever found on the network"},
    KeyRule{medium::kCDInfo, Kind::kPath, Need::kRequired, kNoModels},
    KeyRule{medium::kModelInfo, Kind::kPath, Need::kRequired, kPackageAtOnce},
    KeyRule{medium::kPkgInfo, Kind::kDictionary, Need::kRequired, kNoPackage},
    KeyRule{medium::kSystemMin, Kind::kDictionary, Need::kOptional,
            "every older system is accepted"},
    KeyRule{medium::kSystemMax, Kind::kDictionary, Need::kOptional,
            "every newer system is accepted"},
    KeyRule{
        medium::kVenderName, Kind::kText, Need::kRequired,
        "the package does not find the wizard's files, because their names lack the maker's name"},
    KeyRule{medium::kWLANtool, Kind::kPath, Need::kOptional,
            "no set-up tool runs after a search that finds no wireless device"},
};

constexpr std::array kPackageRules{
    KeyRule{"PkgLocation", Kind::kPath, Need::kRequired, kNoPackage},
    KeyRule{"PkgName", Kind::kText, Need::kOptional, kNoPackage},
    KeyRule{"104", Kind::kText, Need::kOptional, kNoVersionPackage},
    KeyRule{"105", Kind::kText, Need::kOptional, kNoVersionPackage},
    KeyRule{"106", Kind::kText, Need::kOptional, kNoVersionPackage},
    KeyRule{"107", Kind::kText, Need::kOptional, kNoVersionPackage},
    KeyRule{"108", Kind::kText, Need::kOptional, kNoVersionPackage},
    KeyRule{"109", Kind::kText, Need::kOptional, kNoVersionPackage},
};

constexpr std::array kMinimumRules{
    KeyRule{"Major", Kind::kNumberOrText, Need::kRequired, "every older system is accepted"},
    KeyRule{"Minor", Kind::kNumberOrText, Need::kAdvised, "the value counts as 0"},
    KeyRule{"BugFix", Kind::kNumberOrText, Need::kAdvised, "the value counts as 0"},
};

constexpr std::array kMaximumRules{
    KeyRule{"Major", Kind::kNumberOrText, Need::kRequired, "every newer system is accepted"},
    KeyRule{"Minor", Kind::kNumberOrText, Need::kRequired,
            "the value counts as 0, so every later minor version is refused"},
    KeyRule{"BugFix", Kind::kNumberOrText, Need::kRequired,
            "the value counts as 0, so all of that minor version is refused"},
};

constexpr std::array kDescriptionRules{
    KeyRule{"ContainedModel", Kind::kDictionary, Need::kRequired, kNoModels},
    KeyRule{"Type", Kind::kDictionary, Need::kOptional,
            "the medium counts as one with a printer and a scanner package"},
    KeyRule{"KSCSeriesCode", Kind::kText, Need::kAdvised,
            "the support page's address lacks the series"},
    KeyRule{"InstallPKG", Kind::kDictionary, Need::kOptional, "the package's options are all off"},
};

constexpr std::array kTypeRules{
    KeyRule{"Printer", Kind::kBoolean, Need::kOptional, "the value counts as true"},
    KeyRule{"TWAIN", Kind::kBoolean, Need::kOptional, "the value counts as true"},
};

constexpr std::array kOptionRules{
    KeyRule{"PKG_WebLink", Kind::kBoolean, Need::kOptional,
            "the package does not get the intended value"},
    KeyRule{"PKG_KestrelOnline", Kind::kBoolean, Need::kOptional,
            "an absent key counts as false, a value of the wrong kind as true"},
    KeyRule{"PKG_RemoteTool", Kind::kBoolean, Need::kOptional,
            "the package does not get the intended value"},
    KeyRule{"PKG_LabelTool", Kind::kBoolean, Need::kOptional,
            "the package does not get the intended value"},
    KeyRule{"PKG_FontSet", Kind::kAny, Need::kOptional, "the fonts are not installed"},
};

constexpr std::array kModelInformationRules{
    KeyRule{"Model", Kind::kDictionary, Need::kRequired, kPackageAtOnce},
};

constexpr std::array kModelRules{
    KeyRule{"KSCID", Kind::kText, Need::kRequired,
            "without \"KSCID\", the model offers no connection at all: the package opens as soon "
            "as the model is chosen",
            ": the model's identifier at the support centre"},
    KeyRule{"Interfaces", Kind::kDictionary, Need::kAdvised, "the model has USB only"},
};

constexpr std::array kInterfaceRules{
    KeyRule{"USB", Kind::kBoolean, Need::kAdvised, "the model counts as one with USB"},
    KeyRule{"WiredLAN", Kind::kBoolean, Need::kAdvised,
            "the model counts as one without a wired network"},
    KeyRule{"WirelessLAN", Kind::kBoolean, Need::kAdvised,
            "the model counts as one without wireless"},
};

// "NAME" is a placeholder for a model's name.
constexpr std::array kGroups{
    KeyGroup{"Info.plist", "", kInformationRules},
    KeyGroup{"CDCommonInfo.plist", "", kResourceRules},
    KeyGroup{"CDCommonInfo.plist", "PkgInfo/", kPackageRules},
    KeyGroup{"CDCommonInfo.plist", "SystemMin/", kMinimumRules},
    KeyGroup{"CDCommonInfo.plist", "SystemMax/", kMaximumRules},
    KeyGroup{"CDInfo.plist", "", kDescriptionRules},
    KeyGroup{"CDInfo.plist", "Type/", kTypeRules},
    KeyGroup{"CDInfo.plist", "InstallPKG/", kOptionRules},
    KeyGroup{"ModelInfo.plist", "", kModelInformationRules},
    KeyGroup{"ModelInfo.plist", "Model/NAME/", kModelRules},
    KeyGroup{"ModelInfo.plist", "Model/NAME/Interfaces/", kInterfaceRules},
};

bool isPackageVersion(const std::string& key) {
  return !key.empty() && std::all_of(key.begin(), key.end(), isASCIIDigit);
}

// Returns `package` without the version keys that have no rule. checkPackages() reports these keys.
Dictionary withoutOtherVersions(const Dictionary& package) {
  std::vector<Dictionary::Pair> pairs;
  for (const auto& pair : package) {
    const bool known = std::any_of(kPackageRules.begin(), kPackageRules.end(),
                                   [&](const KeyRule& rule) { return rule.key == pair.key; });
    if (known || !isPackageVersion(pair.key)) pairs.push_back(pair);
  }
  return Dictionary(std::move(pairs));
}

// Applies `rules` to the dictionary under `key` in `outer`, if there is one. `place` is the
// location of `outer`.
void checkInner(const Dictionary& outer, DictionaryPlace place, std::string_view key,
                std::span<const KeyRule> rules, OtherKeys otherKeys, Report& report) {
  const auto inner = outer.dictionary(key);
  place.path.emplace_back(key);
  if (inner) checkKeys(*inner, place, rules, otherKeys, report);
}

void checkResources(const Dictionary& resources, const std::string& path, Report& report) {
  const DictionaryPlace top{path, {}};
  checkKeys(resources, top, kResourceRules, OtherKeys::kReported, report);
  if (const auto package = resources.dictionary(medium::kPkgInfo)) {
    checkKeys(withoutOtherVersions(*package), {path, {std::string(medium::kPkgInfo)}},
              kPackageRules, OtherKeys::kReported, report);
  }
  checkInner(resources, top, medium::kSystemMin, kMinimumRules, OtherKeys::kReported, report);
  checkInner(resources, top, medium::kSystemMax, kMaximumRules, OtherKeys::kReported, report);
}

void checkDescription(const Dictionary& description, const std::string& path, Report& report) {
  const DictionaryPlace top{path, {}};
  checkKeys(description, top, kDescriptionRules, OtherKeys::kReported, report);
  checkInner(description, top, "Type", kTypeRules, OtherKeys::kReported, report);
  checkInner(description, top, "InstallPKG", kOptionRules, OtherKeys::kAllowed, report);
}

// Returns whether `list` lacks "Model" but has a value that looks like the description of a model.
bool isWithoutModelKey(const Dictionary& list) {
  return !list.find("Model") && std::any_of(list.begin(), list.end(), [](const auto& pair) {
    const auto* const entry = pair.value.template as<Dictionary>();
    return entry && (entry->find("KSCID") || entry->find("Interfaces"));
  });
}

void checkModels(const Dictionary& models, const std::string& path, Report& report) {
  if (isWithoutModelKey(models)) {
    report.findings.push_back({.id = "model-key-missing",
                               .place = {.file = path},
                               .found = "the models at the top of the list",
                               .expected = "one key, \"Model\", with a dictionary of all models",
                               .effect = kPackageAtOnce,
                               .remedy = "put the models into a dictionary under \"Model\""});
    return;
  }
  checkKeys(models, {path, {}}, kModelInformationRules, OtherKeys::kReported, report);
  const Dictionary entries = models.dictionary("Model").value_or(Dictionary());
  for (const auto& [name, value] : entries) {
    const DictionaryPlace place{path, {"Model", name}};
    const auto* const entry = value.as<Dictionary>();
    if (!entry) {
      report.findings.push_back({.id = "value-kind",
                                 .place = {.file = path, .key = place.path},
                                 .found = described(value),
                                 .expected = "a dictionary",
                                 .effect = "the model has USB only",
                                 .remedy = "write a dictionary, as for the other models"});
      continue;
    }
    checkKeys(*entry, place, kModelRules, OtherKeys::kReported, report);
    checkInner(*entry, place, "Interfaces", kInterfaceRules, OtherKeys::kReported, report);
  }
}

// Reads the property list whose path is in the resource dictionary under `key`, and stores the path
// in `path`. Returns nothing when there is no path or the wizard cannot read the list.
std::optional<Dictionary> namedList(const MediumFiles& files, const Lists& lists,
                                    std::string_view key, const char* what, const char* effect,
                                    std::string& path) {
  const auto named = lists.resources ? lists.resources->string(key) : std::nullopt;
  if (!named) return std::nullopt;
  path = *named;
  return files.list(path, {lists.resourcePlace(key), what, effect});
}

}  // namespace

std::span<const KeyGroup> keyGroups() {
  return kGroups;
}

std::vector<std::string> Lists::modelNames() const {
  return containedModels(KSOROSXCD::initWithCDInfoPlist(description, resources));
}

Place Lists::resourcePlace(std::string_view key, std::string_view inner) const {
  Place place{.file = resourcesPath, .key = {std::string(key)}};
  if (!inner.empty()) place.key.emplace_back(inner);
  return place;
}

bool Lists::anyWireless() const {
  return anySupportsWiFi(modelNames(), models);
}

Lists readLists(const MediumFiles& files) {
  Report& report = files.report();
  Lists lists;
  lists.resourcesPath = "MacResources/CDCommonInfo.plist";
  if (!report.application.empty()) {
    lists.informationPath = report.application + "/Contents/Info.plist";
    lists.information =
        files.list(lists.informationPath,
                   {{.file = lists.informationPath}, "the application's Info.plist", kNothing});
    if (!lists.information) return lists;
    checkKeys(*lists.information, {lists.informationPath, {}}, kInformationRules,
              OtherKeys::kAllowed, report);
    const auto path = lists.information->string("CommonResourcePath");
    if (!path) return lists;
    lists.resourcesPath = *path;
  }
  lists.resources = files.list(lists.resourcesPath,
                               {DictionaryPlace{lists.informationPath, {}}.of("CommonResourcePath"),
                                "the resource dictionary", kNothing});
  if (!lists.resources) return lists;
  checkResources(*lists.resources, lists.resourcesPath, report);
  lists.description = namedList(files, lists, medium::kCDInfo, "the medium description", kNoModels,
                                lists.descriptionPath);
  if (lists.description) checkDescription(*lists.description, lists.descriptionPath, report);
  lists.models = namedList(files, lists, medium::kModelInfo, "the model information",
                           kPackageAtOnce, lists.modelsPath);
  if (lists.models) checkModels(*lists.models, lists.modelsPath, report);
  return lists;
}

}  // namespace onramp::check

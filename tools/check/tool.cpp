#include <filesystem>
#include <fstream>
#include <string>
#include <system_error>
#include <utility>
#include <vector>

#include "base/ascii.h"
#include "media/medium.h"
#include "platform/bundle.h"
#include "tools/check/checks.h"
#include "tools/check/languages.h"

namespace onramp::check {

namespace {

namespace fs = std::filesystem;

constexpr const char* kDisplayName = "CFBundleDisplayName";

std::string firstWord(const std::string& text) {
  return text.substr(0, text.find(' '));
}

bool isExecutable(const std::string& path) {
  std::error_code ignored;
  const fs::perms any = fs::perms::owner_exec | fs::perms::group_exec | fs::perms::others_exec;
  return (fs::status(path, ignored).permissions() & any) != fs::perms::none;
}

// The system cannot start such a script, because it treats the carriage return as part of the
// interpreter's name.
bool isScriptWithCarriageReturn(const std::string& path) {
  std::ifstream file(path, std::ios::binary);
  std::string line;
  return std::getline(file, line) && line.starts_with("#!") && line.ends_with('\r');
}

// Reports a bundle whose Info.plist names no program, or whose program is missing, is not
// executable or is a script with a carriage return in its first line.
void checkProgram(const MediumFiles& files, const Bundle& bundle, const std::string& relative,
                  const char* effect) {
  const std::string list = relative + "/Contents/Info.plist";
  Finding finding{.place = {.file = list, .key = {"CFBundleExecutable"}}, .effect = effect};
  const auto program = bundle.executablePath();
  std::error_code ignored;
  if (!program) {
    finding.id = "program-unnamed";
    finding.place.key.clear();
    finding.found = "no name under \"CFBundleExecutable\"";
    finding.expected = "the program's file name, a string";
    finding.remedy = "write the name";
  } else if (!fs::is_regular_file(*program, ignored)) {
    const std::string name = bundle.infoString("CFBundleExecutable").value_or("");
    finding.id = "program-missing";
    finding.found = "the program " + quoted(name) + ", which does not exist";
    finding.expected = quoted(relative + "/Contents/MacOS/" + name);
    finding.remedy = "put the program there";
  } else if (!isExecutable(*program)) {
    finding.id = "program-not-executable";
    finding.found = "a program without execute permission: " +
                    quoted(program->substr(files.fullPath("").size() + 1));
    finding.expected = "a file that everyone may execute";
    finding.remedy = "chmod a+x, and master the medium on a file system that keeps the permission";
  } else if (isScriptWithCarriageReturn(*program)) {
    finding.id = "program-line-ends";
    finding.found = "a script whose first line ends with a carriage return";
    finding.expected = "lines that end with a line feed only";
    finding.remedy = "save the script with Unix line endings";
  }
  if (!finding.id.empty()) files.report().findings.push_back(std::move(finding));
}

// Checks the translations of the tool's name. If some languages have a translation, reports the
// tables without one, except the table of `region`, whose users see the right name anyway. If the
// name contains the maker's name, reports the translations that do not contain it, because they are
// probably left over from another maker's medium.
void checkTranslations(const MediumFiles& files, const std::string& relative,
                       const std::string& name, const std::string& vendor,
                       const std::string& region) {
  const std::string maker = firstWord(vendor);
  const auto names = [&](const std::string& text) {
    return asciiLowercased(text).find(asciiLowercased(maker)) != std::string::npos;
  };
  const bool namesMaker = !maker.empty() && names(name);
  std::vector<Finding> missing;
  bool isTranslated = false;
  const std::string resources = relative + "/Contents/Resources";
  for (const std::string& language : languagesIn(files, resources, "InfoPlist.strings")) {
    const std::string table =
        (fs::path(resources) / (language + ".lproj") / "InfoPlist.strings").string();
    const auto texts = files.strings(
        table,
        {{.file = table}, "the tool's translated names", "the tool's untranslated name on macOS"});
    if (!texts) continue;
    const auto translated = texts->string(kDisplayName);
    isTranslated = isTranslated || translated;
    if (!translated && !isSameLanguage(language, region)) {
      missing.push_back({.id = "tool-name-untranslated",
                         .severity = Severity::kWarning,
                         .place = {.file = table},
                         .found = "no text under " + quoted(kDisplayName),
                         .expected = "a translation of " + quoted(name),
                         .effect = "users of " + quoted(language) + " see the name " + quoted(name),
                         .remedy = "write the translation"});
    }
    if (!translated || !namesMaker || names(*translated)) continue;
    files.report().findings.push_back(
        {.id = "tool-name-left-over",
         .severity = Severity::kWarning,
         .place = {.file = table, .key = {kDisplayName}},
         .found = "the name " + quoted(*translated) + ", without " + quoted(maker),
         .expected = "a translation of " + quoted(name),
         .effect = "on macOS, users of this file's language see the name " + quoted(*translated),
         .remedy = "translate the tool's current name"});
  }
  if (!isTranslated) return;
  for (Finding& finding : missing)
    files.report().findings.push_back(std::move(finding));
}

}  // namespace

void checkTool(const MediumFiles& files, const Lists& lists) {
  constexpr const char* kEffect =
      "when no wireless device is found, no set-up tool runs; the search begins again instead";
  const Dictionary resources = lists.resources.value_or(Dictionary());
  const Place place = lists.resourcePlace(medium::kWLANtool);
  const auto relative = resources.string(medium::kWLANtool);
  if (!relative) {
    if (!lists.resources || resources.find(medium::kWLANtool) || !lists.anyWireless()) return;
    if (files.report().hasMisspelt(lists.resourcesPath, medium::kWLANtool)) return;
    files.report().findings.push_back({.id = "tool-none",
                                       .severity = Severity::kWarning,
                                       .place = {.file = lists.resourcesPath},
                                       .found = "no \"WLANtool\"",
                                       .expected = "the wireless set-up tool's path",
                                       .effect = kEffect,
                                       .remedy = "add \"WLANtool\""});
    return;
  }
  if (!files.exists(*relative, {place, "the wireless set-up tool", kEffect})) return;
  const auto bundle = Bundle::open(files.fullPath(*relative));
  if (!bundle) {
    files.report().findings.push_back(
        {.id = "tool-no-bundle",
         .place = place,
         .found = "a file at " + quoted(*relative),
         .expected = "an application bundle, which is a folder",
         .effect = kEffect,
         .remedy = "write the path of the folder whose name ends in \".app\""});
    return;
  }
  const std::string list = *relative + "/Contents/Info.plist";
  const auto information =
      files.list(list, {{.file = list}, "the set-up tool's Info.plist", kEffect});
  if (!information) return;
  checkProgram(files, *bundle, *relative, kEffect);
  const auto name = information->string(kDisplayName);
  if (name) {
    checkTranslations(files, *relative, *name, resources.string(medium::kVenderName).value_or(""),
                      information->string("CFBundleDevelopmentRegion").value_or("en"));
    return;
  }
  files.report().findings.push_back(
      {.id = "tool-unnamed",
       .place = {.file = list},
       .found = "no name under \"CFBundleDisplayName\"",
       .expected = "the tool's name, a string",
       .effect =
           "the tool's file name in the device list's menu, unless a translation gives a name",
       .remedy = "write the name"});
}

void describeApplication(const MediumFiles& files, const Lists& lists) {
  if (!lists.information) return;
  Report& report = files.report();
  report.identifier = lists.information->string("CFBundleIdentifier").value_or("");
  const auto program = lists.information->string("CFBundleExecutable");
  if (!program) return;
  const fs::path contents = fs::path(files.application()) / "Contents";
  std::error_code ignored;
  if (fs::is_regular_file(contents / "MacOS" / *program, ignored))
    report.platforms.emplace_back("macOS");
  if (fs::is_regular_file(contents / "Linux" / *program, ignored))
    report.platforms.emplace_back("Linux");
}

void checkApplication(const MediumFiles& files, const Lists& lists) {
  if (!lists.information) return;
  const std::string& application = files.report().application;
  const auto bundle = Bundle::open(files.application());
  if (bundle) {
    checkProgram(files, *bundle, application, "the wizard does not start");
  }
  const auto options =
      lists.description ? lists.description->dictionary("InstallPKG") : std::nullopt;
  const Value* const online = options ? options->find("PKG_KestrelOnline") : nullptr;
  if (!online || online->boolean() == false) return;
  const std::string countries = application + "/Contents/Resources/SupportedKOL.plist";
  const auto list =
      files.list(countries, {{.file = countries},
                             "the list of countries with the online service",
                             "the package is told that the online service is not available"});
  if (!list || list->dictionary("Country")) return;
  files.report().findings.push_back(
      {.id = "key-missing",
       .place = {.file = countries},
       .found = "no dictionary under \"Country\"",
       .expected = "a dictionary whose keys are country codes",
       .effect = "the package is told that the online service is not available",
       .remedy = "write the dictionary"});
}

}  // namespace onramp::check

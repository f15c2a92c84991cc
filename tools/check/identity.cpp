#include <algorithm>
#include <string_view>

#include "base/ascii.h"
#include "base/text.h"
#include "bonjour/identity_keys.h"
#include "media/medium.h"
#include "platform/lowercase.h"
#include "tools/check/checks.h"
#include "tools/check/spelling.h"

namespace onramp::check {

namespace {

constexpr const char* kNoDevice = "no device is ever found on the network";

// Returns whether `type` is "_name._tcp." or "_name._udp." with a name that RFC 6335 section 5.1
// allows.
bool isServiceType(std::string_view type) {
  constexpr std::size_t kLongestName = 15;
  if (!type.starts_with('_') || !(type.ends_with("._tcp.") || type.ends_with("._udp.")))
    return false;
  const std::string_view name = type.substr(1, type.size() - 7);
  const bool characters = std::all_of(name.begin(), name.end(),
                                      [](char c) { return isASCIILetterOrDigit(c) || c == '-'; });
  return characters && name.size() <= kLongestName &&
         std::any_of(name.begin(), name.end(), isASCIILetter) && !name.starts_with('-') &&
         !name.ends_with('-') && name.find("--") == std::string_view::npos;
}

void checkDeclared(const Lists& lists, const std::string& type, Report& report) {
  if (!lists.information) return;
  constexpr const char* kDeclared = "NSBonjourServices";
  const std::string bare = type.substr(0, type.size() - 1);
  const Array* const declared = lists.information->array(kDeclared);
  if (declared && std::find(declared->begin(), declared->end(), Value(bare)) != declared->end()) {
    return;
  }
  report.findings.push_back({.id = "service-undeclared",
                             .place = {.file = lists.informationPath, .key = {kDeclared}},
                             .found = "no " + quoted(bare),
                             .expected = "the medium's service type, without its trailing dot",
                             .effect = "on macOS 15 and later, " + std::string(kNoDevice),
                             .remedy = "add the type"});
}

void checkServiceType(const Lists& lists, Report& report) {
  const Place place = lists.resourcePlace(medium::kBonjourNetwork);
  const auto type = lists.resources->string(medium::kBonjourNetwork);
  if (!type || type->empty()) {
    // readLists() has already reported a value that is not a string.
    if (lists.resources->find(medium::kBonjourNetwork) && !type) return;
    if (!lists.anyWireless()) return;
    if (report.hasMisspelt(lists.resourcesPath, medium::kBonjourNetwork)) return;
    report.findings.push_back({.id = "service-none",
                               .place = type ? place : Place{.file = lists.resourcesPath},
                               .found = type ? "an empty service type" : "no \"BonjourNetwork\"",
                               .expected = "a service type such as \"_pdl-datastream._tcp.\"",
                               .effect = kNoDevice,
                               .remedy = type ? "write the type that the devices announce"
                                              : "add the type that the devices announce"});
    return;
  }
  Spelling known({kIdentifyingTypes.begin(), kIdentifyingTypes.end()});
  Finding finding{.place = place,
                  .found = "the service type " + quoted(*type),
                  .effect = kNoDevice,
                  .remedy = "write the type that the devices announce, with its trailing dot"};
  if (isServiceType(*type + ".")) {
    finding.id = "service-dot";
    finding.found += " without its trailing dot";
    finding.nearest = *type + ".";
    finding.remedy = "add the dot";
  } else if (!isServiceType(*type)) {
    finding.id = "service-malformed";
    finding.found += ", which is malformed";
    finding.expected = "\"_name._tcp.\", with a name of at most 15 letters, digits and hyphens";
  } else if (!identityKeysOf(*type)) {
    finding.id = "service-unknown";
    finding.found += ", for which the wizard cannot read a maker or model";
    finding.expected = "one of _pdl-datastream._tcp., _printer._tcp., _ipp._tcp., _scanner._tcp.";
  }
  if (finding.id.empty()) {
    checkDeclared(lists, *type, report);
    return;
  }
  if (finding.nearest.empty()) finding.nearest = known.nearest(*type).value_or("");
  report.findings.push_back(std::move(finding));
}

void checkVendor(const Lists& lists, Report& report) {
  constexpr std::size_t kLongestFileName = 255;
  const auto written = lists.resources->string(medium::kVenderName);
  if (!written) return;
  const std::string name = medium::vendorName(lists.resources);
  const std::string file = "com." + lowercaseString(name) + ".installpkginfo.plist";
  Finding finding{.place = lists.resourcePlace(medium::kVenderName),
                  .effect = "the package does not find the files that the wizard writes for it",
                  .remedy = "write the maker's name in letters, digits and spaces"};
  const auto isControl = [](char c) { return static_cast<unsigned char>(c) < 0x20 || c == 0x7F; };
  const auto isForeign = [](char c) { return static_cast<unsigned char>(c) >= 0x80; };
  if (name.empty()) {
    finding.id = "vendor-empty";
    finding.found = "an empty name";
    finding.expected = "the maker's name";
  } else if (name.find('/') != std::string::npos || name == "." || name == ".." ||
             std::any_of(name.begin(), name.end(), isControl)) {
    finding.id = "vendor-folder";
    finding.found = quoted(*written) + ", which cannot be the name of a folder";
    finding.expected = "a name that has no \"/\" or control character, and is not \".\" or \"..\"";
  } else if (file.size() > kLongestFileName) {
    finding.id = "vendor-long";
    finding.found = "a name of " + std::to_string(name.size()) + " bytes, not counting spaces";
    finding.remedy = "shorten the name";
    finding.expected =
        "at most " + std::to_string(kLongestFileName - (file.size() - name.size())) + " bytes";
  } else if (std::any_of(name.begin(), name.end(), isForeign)) {
    finding.id = "vendor-letters";
    finding.severity = Severity::kWarning;
    finding.found = quoted(*written) + ", with characters outside ASCII";
    finding.expected = "only the letters A to Z, digits and spaces";
    finding.effect =
        "some programs may fail to find the folder and its files, because they encode the letters "
        "differently";
  }
  if (!finding.id.empty()) report.findings.push_back(std::move(finding));
}

void checkSeries(const Lists& lists, Report& report) {
  const std::string series = lists.description->string("KSCSeriesCode").value_or("");
  const bool opens = isURLText(series);
  if (opens && series.find_first_of("/?#") == std::string::npos) return;
  report.findings.push_back({.id = "series-address",
                             .place = {.file = lists.descriptionPath, .key = {"KSCSeriesCode"}},
                             .found = "the series code " + quoted(series),
                             .expected = "letters and digits",
                             .effect = opens
                                           ? "the button for the support page opens the wrong page"
                                           : "the button for the support page opens nothing",
                             .remedy = "write the code as the support site does"});
}

}  // namespace

void checkIdentity(const Lists& lists, Report& report) {
  if (lists.resources) {
    checkServiceType(lists, report);
    checkVendor(lists, report);
  }
  if (lists.description) checkSeries(lists, report);
}

}  // namespace onramp::check

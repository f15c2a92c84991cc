#include <algorithm>
#include <array>
#include <iterator>
#include <map>
#include <set>
#include <utility>

#include "base/ascii.h"
#include "base/text.h"
#include "media/KSOROSXModel.h"
#include "media/connection_type.h"
#include "media/medium.h"
#include "tools/check/checks.h"
#include "tools/check/key_rules.h"
#include "tools/check/spelling.h"

namespace onramp::check {

namespace {

constexpr std::string_view kContained = "ContainedModel";
constexpr std::array kInterfaces{"USB", "WiredLAN", "WirelessLAN"};

std::vector<std::string> keysOf(const Dictionary& dictionary) {
  std::vector<std::string> keys;
  keys.reserve(dictionary.size());
  for (const auto& [key, unused] : dictionary)
    keys.push_back(key);
  return keys;
}

std::vector<std::string> onlyInFirst(const std::vector<std::string>& first,
                                     const std::vector<std::string>& second) {
  std::vector<std::string> names;
  std::set_difference(first.begin(), first.end(), second.begin(), second.end(),
                      std::back_inserter(names));
  return names;
}

class ModelCheck {
 public:
  ModelCheck(const Lists& lists, Report& report) : lists_(lists), report_(report) {}

  // Reports names that are in the medium description or the model information, but not in both. If
  // two of these names, one from each list, are almost equal, they are reported as one finding.
  void compareLists() {
    const auto contained = lists_.description->dictionary(kContained);
    const auto described = lists_.models->dictionary("Model");
    if (!contained || !described) return;
    const std::vector<std::string> offered = keysOf(*contained);
    const std::vector<std::string> known = keysOf(*described);
    const std::vector<std::string> onlyKnown = onlyInFirst(known, offered);
    std::set<std::string> paired;
    Spelling unmatched(onlyKnown);
    Spelling all(known);
    Spelling allOffered(offered);
    for (const std::string& name : onlyInFirst(offered, known)) {
      const auto pair = unmatched.nearest(name);
      if (pair) paired.insert(*pair);
      undescribed(name, pair, all.nearest(name));
    }
    for (const std::string& name : onlyKnown) {
      if (!paired.contains(name)) unoffered(name, allOffered.nearest(name));
    }
  }

  void names() {
    const auto contained = lists_.description->dictionary(kContained);
    if (!contained) return;
    if (contained->empty()) {
      report_.findings.push_back(
          {.id = "models-none",
           .place = {.file = lists_.descriptionPath, .key = {std::string(kContained)}},
           .found = "no models",
           .expected = "the medium's models as keys",
           .effect = "the package opens at once, without any page",
           .remedy = "add the models"});
    }
    std::map<std::string, std::string> spellings;
    for (const auto& [name, unused] : *contained) {
      announceable(name);
      spelledLikeTheVendor(name);
      const auto [other, isNew] = spellings.try_emplace(asciiLowercased(name), name);
      if (isNew) continue;
      add(name, {.id = "model-twice",
                 .severity = Severity::kWarning,
                 .found = "a name that differs from " + quoted(other->second) +
                          " only in capital letters",
                 .expected = "each model once, spelled as its devices announce it",
                 .effect = "two entries in the list, only one of which finds its devices",
                 .remedy = "remove the one that no device announces"});
    }
  }

 private:
  // Adds a finding about a model's name in the medium description.
  void add(const std::string& name, Finding finding) {
    finding.place = {.file = lists_.descriptionPath, .key = {std::string(kContained), name}};
    report_.findings.push_back(std::move(finding));
  }

  static std::string sameName(std::string_view key, const std::optional<std::string>& nearest) {
    return "the same name under " + quoted(std::string(key)) + " in that list" +
           (nearest ? ", where the nearest name is " + quoted(*nearest) : "");
  }

  // Reports that the model information lacks `name`. `meant` is an almost equal name that only the
  // model information has. `nearest` is the most similar of all names in the model information.
  // Each is nothing if no such name is similar enough.
  void undescribed(const std::string& name, const std::optional<std::string>& meant,
                   const std::optional<std::string>& nearest) {
    add(name,
        {.id = "model-undescribed",
         .found = "a model that " + quoted(lists_.modelsPath) + " does not have",
         .expected = sameName("Model", meant ? std::nullopt : nearest),
         .nearest = meant.value_or(""),
         .effect = "the model has USB only: the package opens as soon as the model is chosen",
         .remedy = meant ? "use one spelling in both lists" : "describe the model in that list"});
  }

  void unoffered(const std::string& name, const std::optional<std::string>& nearest) {
    report_.findings.push_back(
        {.id = "model-unoffered",
         .place = {.file = lists_.modelsPath, .key = {"Model", name}},
         .found = "a model that " + quoted(lists_.descriptionPath) + " does not have",
         .expected = sameName(kContained, nearest),
         .effect = "the model cannot be chosen",
         .remedy = "add the model to that list, or remove it from this one"});
  }

  // Reports a name that no printer can announce, and a name with suspicious spaces. A device
  // announces maker and model as two strings, which the wizard joins with a space. Each string has
  // at most 255 bytes, including the key in front, which for a printer is "usb_MFG=" or "usb_MDL=".
  void announceable(const std::string& name) {
    constexpr std::size_t kMostBytes = 2 * (255 - 8) + 1;
    const std::size_t space = name.find(' ');
    const auto impossible = [&](std::string found, std::string expected, std::string remedy) {
      add(name, {.id = "model-unannounceable",
                 .found = std::move(found),
                 .expected = std::move(expected),
                 .effect = "no device of that name is ever found on the network",
                 .remedy = std::move(remedy)});
    };
    const bool control = std::any_of(name.begin(), name.end(),
                                     [](char c) { return static_cast<unsigned char>(c) < 0x20; });
    if (space == std::string::npos) {
      impossible("a name without a space", "the USB manufacturer, a space, the USB model",
                 "write maker and model as the devices announce them");
    } else if (name.size() > kMostBytes) {
      impossible(
          "a name of " + std::to_string(name.size()) + " bytes",
          "at most " + std::to_string(kMostBytes) + " bytes, the most that a printer can announce",
          "write the name as the devices announce it");
    } else if (control || !isUTF8(name)) {
      impossible("a name with a control character, such as a line break, or with damaged UTF-8",
                 "printable characters", "write the name as the devices announce it");
    } else if (name.front() == ' ' || name.back() == ' ' || name.find("  ") != std::string::npos) {
      const bool edge = name.front() == ' ' || name.back() == ' ';
      add(name, {.id = "model-blanks",
                 .severity = Severity::kWarning,
                 .found = edge ? "a space at an end of the name" : "two spaces in a row",
                 .expected = "the name exactly as the devices announce it",
                 .effect = "only devices that announce these spaces are found; some devices do",
                 .remedy = "remove the spaces unless the devices announce them"});
    }
  }

  // Compares the maker, which is the first word of the model's name, with the first word of the
  // vendor's name. If the two differ only in capital letters, reports this spelling of the maker
  // once.
  void spelledLikeTheVendor(const std::string& name) {
    const auto vendor = lists_.resources->string(medium::kVenderName);
    const std::string maker = name.substr(0, name.find(' '));
    const std::string spelling = vendor ? vendor->substr(0, vendor->find(' ')) : maker;
    if (maker == spelling || asciiLowercased(maker) != asciiLowercased(spelling)) return;
    if (!makers_.insert(maker).second) return;
    add(name,
        {.id = "maker-capitals",
         .severity = Severity::kWarning,
         .found =
             "the maker " + quoted(maker) + ", which \"VenderName\" spells " + quoted(spelling),
         .expected = "the maker as the devices announce it (usb_MFG), capitals included",
         .effect = "devices that announce the maker as " + quoted(spelling) + " are not found",
         .remedy = "use the devices' spelling for all models"});
  }

  const Lists& lists_;
  Report& report_;
  std::set<std::string> makers_;  ///< the spellings that have been reported
};

}  // namespace

void checkModelNames(const Lists& lists, Report& report) {
  if (!lists.description) return;
  ModelCheck check(lists, report);
  check.names();
  if (lists.models) check.compareLists();
}

void checkConnections(const Lists& lists, Report& report) {
  const Dictionary models =
      lists.models.value_or(Dictionary()).dictionary("Model").value_or(Dictionary());
  for (const auto& [name, value] : models) {
    const auto* const entry = value.as<Dictionary>();
    const auto interfaces = entry ? entry->dictionary("Interfaces") : std::nullopt;
    if (!interfaces) continue;
    const bool hasNone = std::all_of(kInterfaces.begin(), kInterfaces.end(), [&](const char* key) {
      return interfaces->boolean(key) == false;
    });
    if (!hasNone) continue;
    report.findings.push_back(
        {.id = "model-unconnected",
         .severity = Severity::kWarning,
         .place = {.file = lists.modelsPath, .key = {"Model", name, "Interfaces"}},
         .found = "a model without any connection",
         .expected = "at least one connection that is true",
         .effect = "the package opens as soon as the model is chosen, as for a model with USB only",
         .remedy = "write <true/> for the connections that the model has"});
  }
}

void describeModels(const Lists& lists, Report& report) {
  const std::vector<std::string> names = lists.modelNames();
  for (const std::string& name : names) {
    const Dictionary record = KSOROSXModel::initWithName(name, lists.models);
    report.models.push_back({name, record.boolean(KSOROSXModel::kSupportUSB).value_or(false),
                             record.boolean(KSOROSXModel::kSupportEthernet).value_or(false),
                             record.boolean(KSOROSXModel::kSupportWiFi).value_or(false)});
  }
  report.start = firstPage(names, lists.models);
}

}  // namespace onramp::check

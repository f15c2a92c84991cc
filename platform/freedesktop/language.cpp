#include "platform/freedesktop/language.h"

#include <algorithm>
#include <array>
#include <utility>

#include "base/ascii.h"

namespace onramp {

namespace {

struct Renamed {
  std::string_view from;
  std::string_view to;
};

// Outdated codes, and the language names that bundles once used instead of codes.
constexpr std::array kRenamed = {
    Renamed{"english", "en"},   Renamed{"german", "de"},  Renamed{"french", "fr"},
    Renamed{"japanese", "ja"},  Renamed{"italian", "it"}, Renamed{"spanish", "es"},
    Renamed{"dutch", "nl"},     Renamed{"swedish", "sv"}, Renamed{"danish", "da"},
    Renamed{"norwegian", "no"}, Renamed{"finnish", "fi"}, Renamed{"portuguese", "pt"},
    Renamed{"korean", "ko"},    Renamed{"chinese", "zh"}, Renamed{"russian", "ru"},
    Renamed{"polish", "pl"},    Renamed{"czech", "cs"},   Renamed{"hungarian", "hu"},
    Renamed{"turkish", "tr"},   Renamed{"greek", "el"},   Renamed{"arabic", "ar"},
    Renamed{"hebrew", "he"},    Renamed{"thai", "th"},    Renamed{"ukrainian", "uk"},
    Renamed{"iw", "he"},        Renamed{"in", "id"}};

std::string_view takePart(std::string_view& identifier) {
  const std::size_t end = std::min(identifier.find_first_of("-_"), identifier.size());
  const std::string_view part = identifier.substr(0, end);
  identifier.remove_prefix(std::min(end + 1, identifier.size()));
  return part;
}

std::string codeOf(std::string_view name) {
  std::string code = asciiLowercased(std::string(name));
  for (const Renamed& renamed : kRenamed) {
    if (code == renamed.from) code = renamed.to;
  }
  const bool valid = (code.size() == 2 || code.size() == 3) &&
                     std::all_of(code.begin(), code.end(), isASCIILetter);
  return valid ? code : std::string();
}

std::string chineseScript(std::string_view region) {
  return region == "TW" || region == "HK" || region == "MO" ? "Hant" : "Hans";
}

// Treats Norwegian Bokmål (nb) and Norwegian (no) as the same language.
std::string_view offeredAs(std::string_view code) {
  return code == "nb" ? "no" : code;
}

// Returns how well an offered language matches a preferred language. A higher number means a better
// match, and 0 means no match.
int fitness(const Language& offered, const Language& preferred) {
  if (offered.code.empty() || offeredAs(offered.code) != offeredAs(preferred.code)) return 0;
  if (!offered.script.empty() && !preferred.script.empty() && offered.script != preferred.script) {
    return 0;
  }
  if (offered.region == preferred.region) return 3;
  return offered.region.empty() ? 2 : 1;
}

// Moves the languages that match `wanted` from `offered` to the end of `chosen`, the best match
// first. Returns whether there was a match.
bool choose(std::vector<std::string>& offered, const Language& wanted,
            std::vector<std::string>& chosen) {
  std::vector<std::pair<int, std::string>> fitting;
  std::erase_if(offered, [&](const std::string& name) {
    const int fit = fitness(Language::parse(name), wanted);
    if (fit > 0) fitting.emplace_back(-fit, name);
    return fit > 0;
  });
  std::sort(fitting.begin(), fitting.end());
  for (auto& [unused, name] : fitting)
    chosen.push_back(std::move(name));
  return !fitting.empty();
}

}  // namespace

Language Language::parse(std::string_view identifier) {
  // The character set and the modifier of a POSIX locale do not matter here.
  identifier = identifier.substr(0, identifier.find_first_of(".@"));
  Language language;
  language.code = codeOf(takePart(identifier));
  while (!identifier.empty()) {
    const std::string_view part = takePart(identifier);
    if (!std::all_of(part.begin(), part.end(), isASCIILetter)) continue;
    if (part.size() == 4) {
      language.script = asciiLowercased(std::string(part));
      language.script[0] = asciiUppercased(language.script[0]);
    }
    if (part.size() == 2) language.region = asciiUppercased(std::string(part));
  }
  if (language.code == "zh" && language.script.empty()) {
    language.script = chineseScript(language.region);
  }
  return language;
}

std::vector<std::string> languagesToSearch(std::vector<std::string> offered,
                                           const std::vector<std::string>& preferred,
                                           const std::string& development) {
  std::vector<std::string> chosen;
  for (const std::string& identifier : preferred) {
    if (choose(offered, Language::parse(identifier), chosen)) break;
  }
  choose(offered, Language::parse(development), chosen);
  if (chosen.empty()) choose(offered, Language::parse("en"), chosen);
  if (!chosen.empty()) return chosen;
  std::erase_if(offered,
                [](const std::string& name) { return Language::parse(name).code.empty(); });
  const auto any = std::min_element(offered.begin(), offered.end());
  if (any != offered.end()) chosen.push_back(*any);
  return chosen;
}

}  // namespace onramp

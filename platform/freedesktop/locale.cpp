#include <cstdlib>
#include <string_view>

#include "platform/freedesktop/language.h"
#include "platform/user_locale.h"

namespace onramp {

namespace {

constexpr const char* kDefaultLanguage = "en";

std::string environment(const char* name) {
  const char* const value = std::getenv(name);
  return value ? value : "";
}

// Returns the locale that the environment names for messages. Returns an empty string when the
// environment names no locale, or the locale C or POSIX.
std::string messagesLocale() {
  for (const char* const name : {"LC_ALL", "LC_MESSAGES", "LANG"}) {
    const std::string locale = environment(name);
    if (locale.empty()) continue;
    const std::string plain = locale.substr(0, locale.find('.'));
    return plain == "C" || plain == "POSIX" ? std::string() : locale;
  }
  return "";
}

std::string withoutCharacterSet(std::string_view locale) {
  return std::string(locale.substr(0, locale.find_first_of(".@")));
}

}  // namespace

std::string localeLanguageCode() {
  return Language::parse(preferredLanguages().front()).code;
}

std::string localeCountryCode() {
  const std::string country = Language::parse(preferredLanguages().front()).region;
  return country.empty() ? Language::parse(messagesLocale()).region : country;
}

std::vector<std::string> preferredLanguages() {
  const std::string locale = messagesLocale();
  if (locale.empty()) return {kDefaultLanguage};
  // As in gettext, LANGUAGE is ignored when no locale is set or when the locale is C or POSIX.
  const std::string list = environment("LANGUAGE") + ":" + locale;
  std::vector<std::string> languages;
  for (std::size_t at = 0; at <= list.size();) {
    const std::size_t end = std::min(list.find(':', at), list.size());
    std::string language = withoutCharacterSet(std::string_view(list).substr(at, end - at));
    if (!Language::parse(language).code.empty()) languages.push_back(std::move(language));
    at = end + 1;
  }
  if (languages.empty()) languages.emplace_back(kDefaultLanguage);
  return languages;
}

}  // namespace onramp

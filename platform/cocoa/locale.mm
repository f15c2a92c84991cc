#import "platform/cocoa/text.h"
#include "platform/user_locale.h"

namespace onramp {

using cocoa::toStdString;

std::string localeLanguageCode() {
  return toStdString([[NSLocale currentLocale] objectForKey:NSLocaleLanguageCode]);
}

std::string localeCountryCode() {
  return toStdString([[[NSLocale currentLocale] objectForKey:NSLocaleCountryCode] uppercaseString]);
}

std::vector<std::string> preferredLanguages() {
  std::vector<std::string> languages;
  for (NSString* language in [NSLocale preferredLanguages]) {
    languages.push_back(toStdString([language stringByReplacingOccurrencesOfString:@"-"
                                                                        withString:@"_"]));
  }
  return languages;
}

}  // namespace onramp

#include "platform/lowercase.h"

#include <wctype.h>
#if __has_include(<xlocale.h>)
#include <xlocale.h>  // macOS declares newlocale() only here
#endif

#include <clocale>
#include <string_view>

#include "base/text.h"

namespace onramp {

namespace {

// Converts letters to lower case by the rules of the neutral locale C.UTF-8, because in a Turkish
// locale "I" becomes an "i" without a dot. If the system lacks C.UTF-8, uses the process's locale.
class PlainLetters {
 public:
  PlainLetters() : locale_(newlocale(LC_CTYPE_MASK, "C.UTF-8", nullptr)) {}
  PlainLetters(const PlainLetters&) = delete;
  PlainLetters& operator=(const PlainLetters&) = delete;
  ~PlainLetters() {
    if (locale_) freelocale(locale_);
  }

  [[nodiscard]] char32_t small(char32_t character) const {
    const auto wide = static_cast<wint_t>(character);
    return static_cast<char32_t>(locale_ ? towlower_l(wide, locale_) : towlower(wide));
  }

 private:
  locale_t locale_;
};

}  // namespace

std::string lowercaseString(const std::string& text) {
  const PlainLetters letters;
  std::string result;
  for (std::string_view rest = text; !rest.empty();) {
    const std::string_view before = rest;
    if (const auto character = takeUTF8(rest)) {
      appendUTF8(result, letters.small(*character));
    } else {
      result += before.front();
    }
  }
  return result;
}

}  // namespace onramp

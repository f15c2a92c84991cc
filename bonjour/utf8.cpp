#include "bonjour/utf8.h"

#include "platform/text.h"

namespace onramp {

bool isUtf8(std::string_view text) {
  while (!text.empty()) {
    if (!takeUTF8(text)) return false;
  }
  return true;
}

}  // namespace onramp

#include "media/text_order.h"

#include <algorithm>

#include "base/ascii.h"

namespace onramp {

void sortIgnoringCase(std::vector<std::string>& texts) {
  std::stable_sort(texts.begin(), texts.end(), [](const std::string& a, const std::string& b) {
    // Comparing bytes as unsigned numbers sorts UTF-8 strings by code point.
    return std::lexicographical_compare(a.begin(), a.end(), b.begin(), b.end(), [](char x, char y) {
      return static_cast<unsigned char>(asciiLowercased(x)) <
             static_cast<unsigned char>(asciiLowercased(y));
    });
  });
}

}  // namespace onramp

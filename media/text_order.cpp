#include "media/text_order.h"

#include <algorithm>

namespace onramp {

namespace {

char lowered(char c) {
  return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

}  // namespace

void sortIgnoringCase(std::vector<std::string>& texts) {
  std::stable_sort(texts.begin(), texts.end(), [](const std::string& a, const std::string& b) {
    // Bytes compare as unsigned, so that UTF-8 texts come in the order of their code points.
    return std::lexicographical_compare(a.begin(), a.end(), b.begin(), b.end(), [](char x, char y) {
      return static_cast<unsigned char>(lowered(x)) < static_cast<unsigned char>(lowered(y));
    });
  });
}

std::string lowercased(std::string text) {
  std::transform(text.begin(), text.end(), text.begin(), lowered);
  return text;
}

}  // namespace onramp

#pragma once

#include <algorithm>
#include <optional>
#include <string>

namespace onramp {

// Characters as protocols and file formats know them, whatever the user's locale. The functions of
// <cctype> follow the locale and are undefined for negative characters.

[[nodiscard]] constexpr bool isASCIIDigit(char c) {
  return c >= '0' && c <= '9';
}

[[nodiscard]] constexpr bool isASCIILetter(char c) {
  return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
}

[[nodiscard]] constexpr bool isASCIILetterOrDigit(char c) {
  return isASCIILetter(c) || isASCIIDigit(c);
}

/// The value of a hexadecimal digit of either case; nothing for any other character.
[[nodiscard]] constexpr std::optional<unsigned> hexDigitValue(char c) {
  if (c >= '0' && c <= '9') return static_cast<unsigned>(c - '0');
  if (c >= 'a' && c <= 'f') return static_cast<unsigned>(c - 'a') + 10;
  if (c >= 'A' && c <= 'F') return static_cast<unsigned>(c - 'A') + 10;
  return std::nullopt;
}

/// The small letter for A to Z; any other character itself.
[[nodiscard]] constexpr char asciiLowercased(char c) {
  return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

/// The capital for a to z; any other character itself.
[[nodiscard]] constexpr char asciiUppercased(char c) {
  return c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c;
}

/// `text` with the letters A to Z made small; other characters stay as they are.
[[nodiscard]] inline std::string asciiLowercased(std::string text) {
  std::transform(text.begin(), text.end(), text.begin(), [](char c) { return asciiLowercased(c); });
  return text;
}

/// `text` with the letters a to z made capital; other characters stay as they are.
[[nodiscard]] inline std::string asciiUppercased(std::string text) {
  std::transform(text.begin(), text.end(), text.begin(), [](char c) { return asciiUppercased(c); });
  return text;
}

}  // namespace onramp

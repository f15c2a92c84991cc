#pragma once

#include <algorithm>
#include <optional>
#include <string>

namespace onramp {

// These functions classify and convert ASCII characters in the same way in every locale, as
// protocols and file formats require. The <cctype> functions depend on the locale, and their
// behaviour is undefined for most negative arguments.

[[nodiscard]] constexpr bool isASCIIDigit(char c) {
  return c >= '0' && c <= '9';
}

[[nodiscard]] constexpr bool isASCIILetter(char c) {
  return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
}

[[nodiscard]] constexpr bool isASCIILetterOrDigit(char c) {
  return isASCIILetter(c) || isASCIIDigit(c);
}

/// Returns the value of a hexadecimal digit of either case, or nothing for any other character.
[[nodiscard]] constexpr std::optional<unsigned> hexDigitValue(char c) {
  if (c >= '0' && c <= '9') return static_cast<unsigned>(c - '0');
  if (c >= 'a' && c <= 'f') return static_cast<unsigned>(c - 'a') + 10;
  if (c >= 'A' && c <= 'F') return static_cast<unsigned>(c - 'A') + 10;
  return std::nullopt;
}

/// Returns the lower-case letter for A to Z, and any other character unchanged.
[[nodiscard]] constexpr char asciiLowercased(char c) {
  return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

/// Returns the upper-case letter for a to z, and any other character unchanged.
[[nodiscard]] constexpr char asciiUppercased(char c) {
  return c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c;
}

/// Returns `text` with the letters A to Z in lower case and all other characters unchanged.
[[nodiscard]] inline std::string asciiLowercased(std::string text) {
  std::transform(text.begin(), text.end(), text.begin(), [](char c) { return asciiLowercased(c); });
  return text;
}

/// Returns `text` with the letters a to z in upper case and all other characters unchanged.
[[nodiscard]] inline std::string asciiUppercased(std::string text) {
  std::transform(text.begin(), text.end(), text.begin(), [](char c) { return asciiUppercased(c); });
  return text;
}

}  // namespace onramp

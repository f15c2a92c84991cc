#pragma once

#include <cstddef>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace onramp {

/// The attributes of a DNS-SD TXT record (RFC 6763 section 6).
class TxtRecord {
 public:
  /// Parses a record's data in wire format: a sequence of strings, each preceded by a length byte.
  /// Skips strings without a key. Returns nothing when a string runs past the end of the data.
  [[nodiscard]] static std::optional<TxtRecord> parse(std::span<const std::byte> data);

  /// Returns the value of the first attribute whose key is `key`, ignoring the case of the letters
  /// A to Z. The value may contain zero bytes. Returns nothing when no attribute has this key, or
  /// when the first attribute that has it contains no "=".
  [[nodiscard]] std::optional<std::string> value(std::string_view key) const;

 private:
  struct Attribute {
    std::string key;
    std::optional<std::string> value;
  };

  std::vector<Attribute> attributes_;
};

}  // namespace onramp

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
  /// Parses the record's data in wire format: a sequence of strings, each preceded by a length
  /// byte. Returns nothing when a string runs past the end of the data. Skips strings without a
  /// key.
  [[nodiscard]] static std::optional<TxtRecord> parse(std::span<const std::byte> data);

  /// Returns the value of the first attribute called `key`, ignoring the case of the letters A to
  /// Z. The value may contain zero bytes. Returns nothing when there is no such attribute, or when
  /// the first one has no "=".
  [[nodiscard]] std::optional<std::string> value(std::string_view key) const;

 private:
  struct Attribute {
    std::string key;
    std::optional<std::string> value;
  };

  std::vector<Attribute> attributes_;
};

}  // namespace onramp

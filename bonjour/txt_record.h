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
  /// Reads the record's data as on the wire: strings, each after its length byte. Returns nothing
  /// when a string runs past the end of the data. Skips a string without a key.
  [[nodiscard]] static std::optional<TxtRecord> parse(std::span<const std::byte> data);

  /// The value of the first attribute called `key`, ignoring case. It is complete even if it
  /// contains zero bytes. Nothing when there is no such attribute, or when it has no "=".
  [[nodiscard]] std::optional<std::string> value(std::string_view key) const;

 private:
  struct Attribute {
    std::string key;
    std::optional<std::string> value;
  };

  std::vector<Attribute> attributes_;
};

}  // namespace onramp

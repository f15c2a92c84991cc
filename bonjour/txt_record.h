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
  /// Reads the record's data as it is on the wire: strings that each follow their length byte.
  /// Nothing when a string runs past the end of the data. A string without a key is passed over.
  [[nodiscard]] static std::optional<TxtRecord> parse(std::span<const std::byte> data);

  /// The value of the first attribute called `key`, whatever the case of its letters, with all its
  /// bytes. Nothing when there is no such attribute or when it is there without an "=".
  [[nodiscard]] std::optional<std::string> value(std::string_view key) const;

 private:
  struct Attribute {
    std::string key;
    std::optional<std::string> value;
  };

  std::vector<Attribute> attributes_;
};

}  // namespace onramp

#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace onramp {

/// The service instance that a DNS-SD device URI names.
struct ServiceInstance {
  std::string name;    ///< without percent escapes
  std::string type;    ///< with its trailing dot, such as "_ipp._tcp."
  std::string domain;  ///< with its trailing dot
  friend bool operator==(const ServiceInstance&, const ServiceInstance&) = default;
};

/// Returns `name` with a percent escape in place of every byte except ASCII letters, digits and
/// "-_.!~*'$".
[[nodiscard]] std::string percentEscaped(std::string_view name);

/// Returns `text` with its percent escapes replaced by their bytes, or nothing when an escape is
/// malformed or the result is not UTF-8.
[[nodiscard]] std::optional<std::string> percentUnescaped(std::string_view text);

/// Returns the instance that a URI of the form scheme://name.type.domain names. Returns nothing
/// when a part is missing or the text after the type does not contain "local.". The type ends with
/// the first "_tcp." or, without a "_tcp.", with the first "_udp.". So a name that contains such a
/// label is misread.
[[nodiscard]] std::optional<ServiceInstance> serviceInstanceOf(std::string_view uri);

/// Returns the host in a URL's authority part (RFC 3986 section 3.2). Returns nothing when the text
/// is not a URL, contains a character outside ASCII, or names no host.
[[nodiscard]] std::optional<std::string> hostOfURL(std::string_view url);

}  // namespace onramp

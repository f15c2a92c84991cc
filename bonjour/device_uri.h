#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace onramp {

/// The three parts that identify a service instance in DNS-SD.
struct ServiceInstance {
  std::string name;    ///< such as "Office Printer"; may be empty
  std::string type;    ///< with its trailing dot, such as "_ipp._tcp."
  std::string domain;  ///< with its trailing dot
  friend bool operator==(const ServiceInstance&, const ServiceInstance&) = default;
};

/// Returns `name` with every byte percent-escaped, except ASCII letters, digits and the characters
/// "-_.!~*'$".
[[nodiscard]] std::string percentEscaped(std::string_view name);

/// Returns `text` with each percent escape replaced by the byte that it encodes. Returns nothing
/// when an escape is malformed or the result is not UTF-8.
[[nodiscard]] std::optional<std::string> percentUnescaped(std::string_view text);

/// Returns the service instance in a URI of the form scheme://name.type.domain. The scheme and the
/// name may be empty, and the name may contain percent escapes. The result's domain is always
/// "local.". Returns nothing when the URI has another form, when the part after the type does not
/// contain "local.", or when percentUnescaped() rejects the name. The type ends with the first
/// "_tcp." or, if there is none, with the first "_udp.". So a name that contains "_tcp." or "_udp."
/// may be misread.
[[nodiscard]] std::optional<ServiceInstance> serviceInstanceOf(std::string_view uri);

/// Returns the host in a URL's authority part (RFC 3986 section 3.2). Removes the brackets around
/// an IPv6 address. Returns nothing when `url` has no scheme or no host, or contains a character
/// that no URL may contain.
[[nodiscard]] std::optional<std::string> hostOfURL(std::string_view url);

}  // namespace onramp

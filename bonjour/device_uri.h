#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace onramp {

/// The service instance that a DNS-SD device URI names.
struct ServiceInstance {
  std::string name;    ///< without percent escapes; may be empty
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

/// Returns the instance that a URI of the form scheme://name.type.domain names. The scheme and the
/// name may be empty. The result's domain is always "local.". Returns nothing when the text is not
/// of this form, when the text after the type does not contain "local.", or when percentUnescaped()
/// refuses the name. The type ends with the first "_tcp." or, without a "_tcp.", with the first
/// "_udp.". So a name that contains one of these labels is misread.
[[nodiscard]] std::optional<ServiceInstance> serviceInstanceOf(std::string_view uri);

/// Returns the host in a URL's authority part (RFC 3986 section 3.2), and an IPv6 host without its
/// brackets. Returns nothing when the text has no scheme or no host, or contains a character that
/// is not allowed in a URL.
[[nodiscard]] std::optional<std::string> hostOfURL(std::string_view url);

}  // namespace onramp

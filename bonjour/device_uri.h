#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace onramp {

/// What a DNS-SD device URI names.
struct ServiceInstance {
  std::string name;    ///< without escapes
  std::string type;    ///< with its closing dot, such as "_ipp._tcp."
  std::string domain;  ///< with its closing dot
  friend bool operator==(const ServiceInstance&, const ServiceInstance&) = default;
};

/// Replaces every byte of `name` by a percent escape, except letters, digits and "-_.!~*'$".
[[nodiscard]] std::string percentEscaped(std::string_view name);

/// Replaces the percent escapes in `text` by their bytes. Returns nothing when an escape is
/// malformed or the result is not UTF-8.
[[nodiscard]] std::optional<std::string> percentUnescaped(std::string_view text);

/// The instance that a URI of the form scheme://name.type.domain names. Nothing when a part is
/// missing or the domain is not "local.". The first "_tcp.", or without one the first "_udp.", ends
/// the type, so a name that contains such a label is misread.
[[nodiscard]] std::optional<ServiceInstance> serviceInstanceOf(std::string_view uri);

/// The host name in a URL's authority part (RFC 3986 section 3.2), ASCII only. Nothing when the
/// text is not a URL or names no host.
[[nodiscard]] std::optional<std::string> hostOfURL(std::string_view url);

}  // namespace onramp

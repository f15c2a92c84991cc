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

/// The name with every byte as a percent escape that a URL's host part may not hold or that would
/// end it there; letters, digits and "-_.!~*'$" stay.
[[nodiscard]] std::string percentEscaped(std::string_view name);

/// The text with its percent escapes replaced; nothing when an escape is broken or the outcome is
/// not UTF-8.
[[nodiscard]] std::optional<std::string> percentUnescaped(std::string_view text);

/// The instance that a URI of the form scheme://name.type.domain names; nothing when a piece of it
/// is missing or the domain is not "local.". The type is the one before the first "_tcp." (else
/// "_udp."), so a name that has or ends in such a label leads astray.
[[nodiscard]] std::optional<ServiceInstance> serviceInstanceOf(std::string_view uri);

/// The host name in a URL's authority part (RFC 3986 section 3.2), ASCII only; nothing when the
/// text is no URL or names no host.
[[nodiscard]] std::optional<std::string> hostOfURL(std::string_view url);

}  // namespace onramp

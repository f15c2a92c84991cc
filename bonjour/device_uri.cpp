#include "bonjour/device_uri.h"

#include <algorithm>

#include "base/ascii.h"
#include "base/text.h"

namespace onramp {

namespace {

constexpr std::string_view kAuthorityStart = "://";
constexpr std::string_view kLocalDomain = "local.";
constexpr std::size_t kProtocolLabelLength = std::string_view("_tcp.").size();
constexpr std::size_t kDotAndLetter = 2;  // "_tcp." follows at least one letter and a dot

bool staysInName(char c) {
  return isASCIILetterOrDigit(c) || std::string_view("-_.!~*'$").find(c) != std::string_view::npos;
}

bool mayBeInURL(char c) {
  return c > ' ' && c < 0x7f && std::string_view("\"<>\\^`{|}").find(c) == std::string_view::npos;
}

}  // namespace

std::string percentEscaped(std::string_view name) {
  constexpr std::string_view kDigits = "0123456789ABCDEF";
  std::string escaped;
  escaped.reserve(name.size());
  for (const char c : name) {
    if (staysInName(c)) {
      escaped += c;
      continue;
    }
    const auto byte = static_cast<unsigned char>(c);
    escaped += '%';
    escaped += kDigits[byte >> 4U];
    escaped += kDigits[byte & 0xfU];
  }
  return escaped;
}

std::optional<std::string> percentUnescaped(std::string_view text) {
  std::string plain;
  plain.reserve(text.size());
  while (!text.empty()) {
    if (text.front() != '%') {
      plain += text.front();
      text.remove_prefix(1);
      continue;
    }
    if (text.size() < 3) return std::nullopt;
    const auto high = hexDigitValue(text[1]);
    const auto low = hexDigitValue(text[2]);
    if (!high || !low) return std::nullopt;
    plain += static_cast<char>(*high << 4U | *low);
    text.remove_prefix(3);
  }
  if (!isUTF8(plain)) return std::nullopt;
  return plain;
}

std::optional<ServiceInstance> serviceInstanceOf(std::string_view uri) {
  std::size_t protocol = uri.find("_tcp.");
  if (protocol == std::string_view::npos) protocol = uri.find("_udp.");
  if (protocol == std::string_view::npos || protocol < kDotAndLetter) return std::nullopt;

  const std::size_t typeEnd = protocol + kProtocolLabelLength;
  if (uri.substr(typeEnd).rfind(kLocalDomain) == std::string_view::npos) return std::nullopt;

  const std::size_t dot = uri.substr(0, protocol - kDotAndLetter).rfind('.');
  const std::size_t scheme = uri.find(kAuthorityStart);
  if (dot == std::string_view::npos || scheme == std::string_view::npos) return std::nullopt;
  const std::size_t nameStart = scheme + kAuthorityStart.size();
  if (nameStart > dot) return std::nullopt;

  const auto name = percentUnescaped(uri.substr(nameStart, dot - nameStart));
  if (!name) return std::nullopt;
  return ServiceInstance{*name, std::string(uri.substr(dot + 1, typeEnd - dot - 1)),
                         std::string(kLocalDomain)};
}

std::optional<std::string> hostOfURL(std::string_view url) {
  if (!std::all_of(url.begin(), url.end(), mayBeInURL)) return std::nullopt;
  const std::size_t scheme = url.find(kAuthorityStart);
  if (scheme == std::string_view::npos || scheme == 0) return std::nullopt;
  if (url.find_first_of("/?#") < scheme) return std::nullopt;

  std::string_view authority = url.substr(scheme + kAuthorityStart.size());
  authority = authority.substr(0, authority.find_first_of("/?#"));
  if (const auto at = authority.rfind('@'); at != std::string_view::npos) {
    authority.remove_prefix(at + 1);
  }
  char end = ':';
  if (authority.starts_with('[')) {
    authority.remove_prefix(1);
    end = ']';
  }
  const std::string_view host = authority.substr(0, authority.find(end));
  if (host.empty()) return std::nullopt;
  return std::string(host);
}

}  // namespace onramp

// Parses each input as a device URI and as a URL. Then escapes and unescapes it. If it is UTF-8 and
// not ambiguous as a service's name, also parses the device URI of a service with this name.

#include <cstdint>
#include <cstdlib>
#include <string>

#include "base/text.h"
#include "bonjour/device_uri.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string text(reinterpret_cast<const char*>(data), size);

  if (const auto instance = onramp::serviceInstanceOf(text)) {
    if (instance->domain != "local." || !onramp::isUTF8(instance->name)) std::abort();
    if (!instance->type.ends_with("_tcp.") && !instance->type.ends_with("_udp.")) std::abort();
  }
  if (const auto host = onramp::hostOfURL(text)) {
    if (host->empty() || host->find_first_of("/?#@") != std::string::npos) std::abort();
  }

  const std::string escaped = onramp::percentEscaped(text);
  const bool utf8 = onramp::isUTF8(text);
  if (onramp::percentUnescaped(escaped).has_value() != utf8) std::abort();
  // Dots are not escaped in a URI. If a name contains a dot or ends in "_tcp", its end may be read
  // as part of the service type.
  const bool ambiguous = text.find('.') != std::string::npos || text.ends_with("_tcp");
  if (utf8 && !ambiguous) {
    const onramp::ServiceInstance whole{text, "_ipp._tcp.", "local."};
    if (onramp::serviceInstanceOf("dnssd://" + escaped + "._ipp._tcp.local.") != whole) {
      std::abort();
    }
  }
  return 0;
}

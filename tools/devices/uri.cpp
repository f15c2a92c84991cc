#include <iostream>
#include <optional>
#include <vector>

#include "bonjour/KSNetService.h"
#include "tools/devices/commands.h"
#include "tools/devices/text.h"

namespace onramp::devices {

int showURI(const URIOptions& options) {
  std::optional<std::vector<std::string>> addresses;
  const int status =
      KSNetServiceCopyAddressesForDeviceURI(options.uri, &addresses, options.seconds);
  if (status != 0 || !addresses) {
    std::cerr << "onramp-devices: no IPv4 address for " << inQuotes(options.uri)
              << ": the URI is not supported, or its host did not answer within "
              << durationText(options.seconds)
              << "; \"onramp-devices browse -v\" shows the URIs of the announced devices\n";
    return 1;
  }
  for (const std::string& address : *addresses)
    std::cout << address << '\n';
  return 0;
}

}  // namespace onramp::devices

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
    std::cerr << "onramp-devices: no IPv4 addresses for " << inQuotes(options.uri) << " within "
              << durationText(options.seconds)
              << "; \"onramp-devices browse\" shows which devices are announced\n";
    return 1;
  }
  for (const std::string& address : *addresses)
    std::cout << address << '\n';
  return 0;
}

}  // namespace onramp::devices

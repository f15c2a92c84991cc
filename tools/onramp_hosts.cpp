// onramp-hosts: shows what the wizard's network layers see from this computer.

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <iostream>
#include <iterator>
#include <optional>
#include <span>
#include <string>
#include <string_view>

#include "netconfig/current_interface.h"
#include "netconfig/local_address_list.h"
#include "platform/dynamic_store.h"
#include "snmp/broadcast_search.h"
#include "snmp/protocol.h"

namespace {

using namespace onramp;

constexpr int kBadUsage = 2;

constexpr std::string_view kUsage = R"(usage: onramp-hosts [--no-search]
Shows this computer's primary network interface and IPv4 addresses, and the
devices that answer an SNMP broadcast search, which takes six to eight seconds
for every line of addresses with a broadcast address.

  -n, --no-search  do not search
  -h, --help       show this text

Exit status: 0 when the computer's configuration could be shown, whoever
answers; 1 when not; 2 for a wrong command line.
)";

struct Options {
  bool search = true;
  bool help = false;
};

// Nothing, after a message, when they are wrong.
std::optional<Options> parse(std::span<char*> arguments) {
  Options options;
  for (const std::string_view argument : arguments) {
    if (argument == "-n" || argument == "--no-search") {
      options.search = false;
    } else if (argument == "-h" || argument == "--help") {
      options.help = true;
    } else {
      std::cerr << "onramp-hosts: \"" << argument
                << "\" is no option of this command; --help lists those that are\n";
      return std::nullopt;
    }
  }
  return options;
}

std::string joined(const Dictionary& entry, std::string_view key) {
  const Array* texts = entry.array(key);
  if (!texts || texts->empty()) return "-";
  std::string line;
  for (const Value& text : *texts) {
    if (const auto* string = text.as<std::string>()) line += (line.empty() ? "" : ",") + *string;
  }
  return line;
}

bool showConfiguration() {
  std::cout << "primary interface: " << KSSCCopyCurrentInterfaceName().value_or("none") << '\n';
  local_address_list list;
  if (const int status = KSSysConfigCopyCurrentLocalAddressList(&list); status != 0) {
    std::cerr << "onramp-hosts: the system's network configuration could not be read (error "
              << status << "); memory or open files may be short: close programs and try again\n";
    return false;
  }
  std::cout << "local addresses:" << (list->empty() ? " none\n" : "\n");
  for (const Value& value : *list) {
    const auto* entry = value.as<Dictionary>();
    if (!entry) continue;
    std::cout << "  address " << joined(*entry, kSCPropNetIPv4Addresses) << "  mask "
              << joined(*entry, kSCPropNetIPv4SubnetMasks) << "  broadcast "
              << joined(*entry, kSCPropNetIPv4BroadcastAddresses) << '\n';
  }
  return true;
}

void showDevices() {
  std::cout << "devices that answer:" << std::flush;
  const Array devices = snmp_broadcast_search(active_interface_table);
  std::cout << (devices.empty() ? " none\n" : "\n");
  for (const Value& value : devices) {
    const auto* device = value.as<Dictionary>();
    if (!device) continue;
    const std::int64_t interface = device->integerValue(kActiveIFKey);
    std::cout
        << "  address " << device->string(kIPAddressKey).value_or("-") << "  " << kActiveIFKey
        << ' '
        << interface << (interface == kActiveIFWireless ? " (wireless)\n" : " (not wireless)\n");
  }
}

}  // namespace

int main(int count, char* arguments[]) {
  const std::optional<Options> options =
      parse(std::span(arguments, static_cast<std::size_t>(count)).subspan(1));
  if (!options) return kBadUsage;
  if (options->help) {
    std::cout << kUsage << std::flush;
    return std::cout ? EXIT_SUCCESS : EXIT_FAILURE;
  }
  if (!showConfiguration()) return EXIT_FAILURE;
  if (options->search) showDevices();
  if (!std::cout.flush()) {
    std::cerr << "onramp-hosts: the output could not be written; is its disk full?\n";
    return EXIT_FAILURE;
  }
  return EXIT_SUCCESS;
}

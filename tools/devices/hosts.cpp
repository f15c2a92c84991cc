#include <cstdint>
#include <iostream>
#include <nlohmann/json.hpp>
#include <string>
#include <string_view>

#include "netconfig/current_interface.h"
#include "netconfig/local_address_list.h"
#include "platform/dynamic_store.h"
#include "snmp/broadcast_search.h"
#include "snmp/protocol.h"
#include "tools/devices/commands.h"
#include "tools/devices/json_output.h"

namespace onramp::devices {

namespace {

constexpr int kUnreadableConfiguration = 1;

std::string textsUnder(const Dictionary& entry, std::string_view key) {
  const Array* const texts = entry.array(key);
  std::string line;
  for (const Value& text : texts ? *texts : Array()) {
    if (const auto* string = text.as<std::string>()) line += (line.empty() ? "" : ",") + *string;
  }
  return line.empty() ? "-" : line;
}

void printAddresses(const std::string& primary, const Array& list) {
  std::cout << "primary interface: " << primary << '\n';
  std::cout << "local addresses:" << (list.empty() ? " none\n" : "\n");
  for (const Value& value : list) {
    const auto* entry = value.as<Dictionary>();
    if (!entry) continue;
    std::cout << "  address " << textsUnder(*entry, kSCPropNetIPv4Addresses) << "  mask "
              << textsUnder(*entry, kSCPropNetIPv4SubnetMasks) << "  broadcast "
              << textsUnder(*entry, kSCPropNetIPv4BroadcastAddresses) << '\n';
  }
}

void printDevices(const Array& devices) {
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

nlohmann::ordered_json jsonOfHosts(const std::string& primary, const Array& list,
                                   const Array& devices) {
  nlohmann::ordered_json object{{"version", 1},
                                {"primaryInterface", primary},
                                {"addresses", nlohmann::ordered_json::array()},
                                {"devices", nlohmann::ordered_json::array()}};
  for (const Value& value : list) {
    const auto* entry = value.as<Dictionary>();
    if (!entry) continue;
    object["addresses"].push_back(
        {{"addresses", textsUnder(*entry, kSCPropNetIPv4Addresses)},
         {"masks", textsUnder(*entry, kSCPropNetIPv4SubnetMasks)},
         {"broadcast", textsUnder(*entry, kSCPropNetIPv4BroadcastAddresses)}});
  }
  for (const Value& value : devices) {
    const auto* device = value.as<Dictionary>();
    if (!device) continue;
    object["devices"].push_back({{"address", device->string(kIPAddressKey).value_or("")},
                                 {"value", device->integerValue(kActiveIFKey)}});
  }
  return object;
}

}  // namespace

int showHosts(const HostsOptions& options) {
  local_address_list list;
  const std::string primary = KSSCCopyCurrentInterfaceName().value_or("none");
  if (const int status = KSSysConfigCopyCurrentLocalAddressList(&list); status != 0) {
    std::cerr
        << "onramp-devices: the system's network configuration could not be read (error " << status
        << "); memory or file descriptors may be exhausted: close some programs and try again\n";
    return kUnreadableConfiguration;
  }
  if (!options.json) printAddresses(primary, *list);
  if (!options.json && options.search) std::cout << "devices that answer:" << std::flush;
  const Array devices = options.search ? snmp_broadcast_search(active_interface_table) : Array();
  if (options.json) {
    std::cout << printed(jsonOfHosts(primary, *list, devices));
  } else if (options.search) {
    printDevices(devices);
  }
  return 0;
}

}  // namespace onramp::devices

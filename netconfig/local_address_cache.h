#pragma once

#include <optional>
#include <string>

#include "netconfig/local_address_list.h"

/// The process's one kept list of local addresses. Main thread only.
namespace onramp {

/// Fills the cache and has it made anew at every change of an interface's IPv4 state, from then on
/// until the process ends. A failure leaves the cache empty or unrefreshed and is not reported.
void AddNetworkInterfaceListChangeCallbackSCF();

/// The cached list, or null. It does not change any more: a refresh puts a new one in its place.
[[nodiscard]] local_address_list local_address_cache_copy();

/// The first address of the first cached interface whose subnet holds the IPv4 address
/// `address_text`. Nothing without such an interface, for a text that is no address, and by design
/// as soon as the search meets an interface without a readable first address and mask, even when a
/// later one would match.
[[nodiscard]] std::optional<std::string> local_address_for_destination(
    const std::string& address_text);

}  // namespace onramp

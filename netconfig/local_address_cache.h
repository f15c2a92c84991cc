#pragma once

#include <optional>
#include <string>

#include "netconfig/local_address_list.h"

/// The process's cached list of local addresses. All functions must be called on the main thread.
namespace onramp {

/// Fills the cache if it holds no list. From then on, until the process ends, replaces the list
/// whenever an interface's IPv4 state changes. A failure leaves the cache without a list or with an
/// outdated one, and is not reported.
void AddNetworkInterfaceListChangeCallbackSCF();

/// Returns the cached list, or null when there is none. The returned list never changes; when the
/// network changes, the cache gets a new one.
[[nodiscard]] local_address_list local_address_cache_copy();

/// Returns the first address of the first cached interface whose subnet, given by its first address
/// and mask, contains the IPv4 address `address_text`. Returns nothing when there is no such
/// interface or the text is not an address. By design, also returns nothing when an earlier
/// interface has no readable address or mask.
[[nodiscard]] std::optional<std::string> local_address_for_destination(
    const std::string& address_text);

}  // namespace onramp

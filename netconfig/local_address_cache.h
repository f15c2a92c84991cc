#pragma once

#include <optional>
#include <string>

#include "netconfig/local_address_list.h"

namespace onramp {

// These functions share one cached list of the computer's addresses. They must be called on the
// main thread.

/// Fills the cache if it is empty. From then on, until the process exits, replaces the cached list
/// whenever an interface's IPv4 configuration changes. Failures are not reported; they leave the
/// cache empty or out of date.
void AddNetworkInterfaceListChangeCallbackSCF();

/// Returns the cached list, or null when there is none. The returned list never changes.
[[nodiscard]] local_address_list local_address_cache_copy();

/// Finds the first interface in the cached list whose subnet contains `address_text`, an IPv4
/// address in dotted form, and returns that interface's first address. An interface's first address
/// and first mask define its subnet. Returns nothing when no subnet contains the address, or when
/// `address_text` is not an IPv4 address. By design, also returns nothing if the search reaches an
/// interface without a valid address and mask.
[[nodiscard]] std::optional<std::string> local_address_for_destination(
    const std::string& address_text);

}  // namespace onramp

#pragma once

#include <optional>
#include <string>

#include "netconfig/local_address_list.h"

/// The functions below share one cached list of the computer's addresses. All must be called on the
/// main thread.
namespace onramp {

/// Fills the cache if it holds no list. From then on, until the process ends, a new list replaces
/// the cached one whenever an interface's IPv4 configuration changes. A failure is not reported. It
/// leaves the cache empty, or leaves an outdated list in it.
void AddNetworkInterfaceListChangeCallbackSCF();

/// Returns the cached list, or null when there is none. The returned list never changes.
[[nodiscard]] local_address_list local_address_cache_copy();

/// Looks for the first interface in the cached list whose subnet contains `address_text`, a dotted
/// IPv4 text, and returns that interface's first address. An interface's first address and first
/// mask define its subnet. Returns nothing when no subnet contains the address or the text is not
/// an address. By design, the search also ends with nothing at the first interface without a valid
/// address and mask.
[[nodiscard]] std::optional<std::string> local_address_for_destination(
    const std::string& address_text);

}  // namespace onramp

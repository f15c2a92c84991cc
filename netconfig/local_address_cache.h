#pragma once

#include <optional>
#include <string>

#include "netconfig/local_address_list.h"

/// The process's cached list of local addresses. All functions must be called on the main thread.
namespace onramp {

/// Fills the cache and then, until the process ends, replaces it whenever an interface's IPv4 state
/// changes. A failure leaves the cache empty or out of date and is not reported.
void AddNetworkInterfaceListChangeCallbackSCF();

/// Returns the cached list, or null when there is none. A list never changes; a refresh replaces it
/// by a new one.
[[nodiscard]] local_address_list local_address_cache_copy();

/// Returns the first address of the first cached interface whose subnet contains the IPv4 address
/// `address_text`. Returns nothing when there is no such interface or the text is not an address.
/// By design, the search ends at the first interface without a readable address and mask, even when
/// a later one would match.
[[nodiscard]] std::optional<std::string> local_address_for_destination(
    const std::string& address_text);

}  // namespace onramp

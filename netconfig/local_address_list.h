#pragma once

#include <cstddef>
#include <memory>
#include <string>
#include <string_view>

#include "base/value.h"

namespace onramp {

/// The computer's IPv4 addresses as they were when the list was made: one dictionary for every
/// interface that has IPv4 state, in no promised order, with at most the arrays
/// kSCPropNetIPv4Addresses, kSCPropNetIPv4BroadcastAddresses and kSCPropNetIPv4SubnetMasks of
/// dotted texts. Null where there is no list.
using local_address_list = std::shared_ptr<const Array>;

/// Result of a list operation that was called wrongly.
inline constexpr int kLocalAddressListMisused = 1;

/// Makes a new list and stores it in `*out_list`, which has to be null before. 0 on success, and a
/// computer without IPv4 is one; kLocalAddressListMisused when `out_list` is null or already holds
/// a list; else the dynamic store's own error code, kSCStatusFailed when it gives none. On failure
/// `*out_list` stays as it was.
int KSSysConfigCopyCurrentLocalAddressList(local_address_list* out_list);

/// The number of interfaces in `list`; 0 for null.
[[nodiscard]] std::size_t local_address_list_count(const local_address_list& list);

/// The first text of the array under `key` in entry `index`; null when any piece of that is
/// missing. Lives as long as the list.
[[nodiscard]] const std::string* local_address_list_value(const local_address_list& list,
                                                          std::size_t index, std::string_view key);

/// local_address_list_value of kSCPropNetIPv4Addresses, kSCPropNetIPv4SubnetMasks and
/// kSCPropNetIPv4BroadcastAddresses.
[[nodiscard]] const std::string* local_address_at(const local_address_list& list,
                                                  std::size_t index);
[[nodiscard]] const std::string* local_subnet_mask_at(const local_address_list& list,
                                                      std::size_t index);
[[nodiscard]] const std::string* local_broadcast_address_at(const local_address_list& list,
                                                            std::size_t index);

}  // namespace onramp

#pragma once

#include <cstddef>
#include <memory>
#include <string>
#include <string_view>

#include "base/value.h"

namespace onramp {

/// The computer's IPv4 addresses at the time the list was made: one dictionary for every interface
/// that has an IPv4 entity in the dynamic store (platform/dynamic_store.h), in no particular order.
/// Each dictionary has arrays of dotted texts under kSCPropNetIPv4Addresses,
/// kSCPropNetIPv4BroadcastAddresses and kSCPropNetIPv4SubnetMasks; an array may be missing. Null
/// when there is no list.
using local_address_list = std::shared_ptr<const Array>;

/// The error code for an invalid argument.
inline constexpr int kLocalAddressListMisused = 1;

/// Makes a new list and stores it in `*out_list`, which must be null on entry. Returns 0 on
/// success; the list of a computer without IPv4 is empty. Returns kLocalAddressListMisused when
/// `out_list` is null or `*out_list` already holds a list. For any other failure, returns the
/// dynamic store's error code, or kSCStatusFailed when the store reports none. On failure
/// `*out_list` is unchanged.
int KSSysConfigCopyCurrentLocalAddressList(local_address_list* out_list);

/// Returns the number of interfaces in `list`; 0 for null.
[[nodiscard]] std::size_t local_address_list_count(const local_address_list& list);

/// Returns the first text of the array under `key` in entry `index`, or null when the entry, the
/// array or the text is missing. The text is valid as long as the list exists.
[[nodiscard]] const std::string* local_address_list_value(const local_address_list& list,
                                                          std::size_t index, std::string_view key);

/// The next three functions return local_address_list_value() for kSCPropNetIPv4Addresses,
/// kSCPropNetIPv4SubnetMasks and kSCPropNetIPv4BroadcastAddresses, respectively.
[[nodiscard]] const std::string* local_address_at(const local_address_list& list,
                                                  std::size_t index);
[[nodiscard]] const std::string* local_subnet_mask_at(const local_address_list& list,
                                                      std::size_t index);
[[nodiscard]] const std::string* local_broadcast_address_at(const local_address_list& list,
                                                            std::size_t index);

}  // namespace onramp

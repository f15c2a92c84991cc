#pragma once

#include <cstddef>
#include <memory>
#include <string>
#include <string_view>

#include "base/value.h"

namespace onramp {

/// The computer's IPv4 addresses as they were when the list was made. The list has one dictionary
/// for every interface with an IPv4 entity in the dynamic store (platform/dynamic_store.h), in no
/// particular order. Each dictionary has arrays of strings in dotted form under
/// kSCPropNetIPv4Addresses, kSCPropNetIPv4BroadcastAddresses and kSCPropNetIPv4SubnetMasks. Any of
/// these arrays may be missing. A null pointer means that there is no list.
using local_address_list = std::shared_ptr<const Array>;

/// KSSysConfigCopyCurrentLocalAddressList() returns this status for an invalid argument.
inline constexpr int kLocalAddressListMisused = 1;

/// Reads the computer's addresses, stores them as a new list in `*out_list` and returns 0. The list
/// is empty on a computer without IPv4. Returns kLocalAddressListMisused when `out_list` is null or
/// `*out_list` already holds a list. When the dynamic store cannot be read, returns the store's
/// error code, or kSCStatusFailed when the store reports no error. On failure, `*out_list` is
/// unchanged.
int KSSysConfigCopyCurrentLocalAddressList(local_address_list* out_list);

/// Returns the number of interfaces in `list`, or 0 for a null list.
[[nodiscard]] std::size_t local_address_list_count(const local_address_list& list);

/// Returns the first element of the array under `key` in the list's entry `index`. Returns null
/// when the list is null or has no entry `index`, and when the array is missing, is empty or does
/// not begin with a string. The result points into the list.
[[nodiscard]] const std::string* local_address_list_value(const local_address_list& list,
                                                          std::size_t index, std::string_view key);

/// These three functions call local_address_list_value() with the keys kSCPropNetIPv4Addresses,
/// kSCPropNetIPv4SubnetMasks and kSCPropNetIPv4BroadcastAddresses, respectively.
[[nodiscard]] const std::string* local_address_at(const local_address_list& list,
                                                  std::size_t index);
[[nodiscard]] const std::string* local_subnet_mask_at(const local_address_list& list,
                                                      std::size_t index);
[[nodiscard]] const std::string* local_broadcast_address_at(const local_address_list& list,
                                                            std::size_t index);

}  // namespace onramp

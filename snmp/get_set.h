#pragma once

#include <cstdint>
#include <span>

#include "snmp/records.h"
#include "snmp/status.h"

namespace onramp {

// snmp_get and snmp_set complete the room; no part of the program calls them.

/// The type that the caller expects of one binding, and the place for its value.
struct snmp_result_slot {
  std::uint64_t unused = 0;
  std::uint64_t type = kTagNull;
  std::int64_t int_value = 0;
  snmp_octets* octets = nullptr;  ///< for type 4; holds at most `capacity` bytes
};

/// Asks `address` for the bindings of `message`, one for each slot, and copies the reply's values
/// to the slots. See snmp_exchange for `address` and `mode`. Sends a get-next request when
/// `pdu_type` says so, otherwise a get request. A string is followed by a zero byte when the slot
/// has room for one. The bindings' `octets_value` is null afterwards.
///
/// Returns the status of snmp_exchange or, when that is SNMP_OK, the reply's error status. Returns
/// SNMP_ERR_CODEC when a value's type differs from its slot's, when the value does not fit there,
/// or when there is no slot for it.
[[nodiscard]] snmp_status snmp_get(snmp_message& message, std::span<snmp_result_slot> results,
                                   const char* address, std::uint32_t mode);

/// Sets the bindings of `message` at `address`. A binding takes its type from the slot that its
/// `index` names. When that type is a string (type 4), it takes its value from there too; otherwise
/// it keeps its own value. Copies the reply's values to the slots and returns the status as
/// snmp_get does.
///
/// Returns SNMP_ERR_CODEC and sends nothing when the strings, each rounded up to 16 bytes, exceed
/// kReplySize in total. A binding's `octets_value` is null afterwards when it held a string.
[[nodiscard]] snmp_status snmp_set(snmp_message& message, std::span<snmp_result_slot> results,
                                   const char* address, std::uint32_t mode);

}  // namespace onramp

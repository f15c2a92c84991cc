#pragma once

#include <cstdint>
#include <span>

#include "snmp/records.h"
#include "snmp/status.h"

namespace onramp {

// No part of the program calls snmp_get and snmp_set. They complete the SNMP library.

/// The type that the caller expects of one binding, and the place for the binding's value.
struct snmp_result_slot {
  std::uint64_t unused = 0;
  std::uint64_t type = kTagNull;
  std::int64_t int_value = 0;     ///< for types 1, 2 and 65 to 67
  snmp_octets* octets = nullptr;  ///< for type 4; holds at most `capacity` bytes
};

/// Asks the device at `address` for the bindings of `message` and copies the reply's values to the
/// slots in `results`. There must be one slot for each binding. Values of types 6, 64 and 68 are
/// not copied. See snmp_exchange for `address` and `mode`. Sends a get-next request when `pdu_type`
/// is kPduGetNext, otherwise a get request. A string is followed by a zero byte when the slot has
/// room for one. The `octets_value` of each binding is null afterwards.
///
/// Returns the status of snmp_exchange or, when that is SNMP_OK, the reply's error status. Returns
/// SNMP_ERR_CODEC when there are more slots than bindings in the array, when a value has another
/// type than its slot, when a value does not fit in its slot, and when a value has no slot.
[[nodiscard]] snmp_status snmp_get(snmp_message& message, std::span<snmp_result_slot> results,
                                   const char* address, std::uint32_t mode);

/// Sends the bindings of `message` to the device at `address` in a set request. A binding takes its
/// type from the slot at its `index`. If this type is 4, a string, the binding takes its value from
/// the slot, too; otherwise it keeps its own value. Copies the reply's values to the slots and
/// returns the status as snmp_get does.
///
/// Returns SNMP_ERR_CODEC and sends nothing when `varbind_count` exceeds the size of the array,
/// when a binding has no slot, when a string has no value, and when the strings do not fit in a
/// buffer of kReplySize bytes, where every string starts at a multiple of 16. A string here is a
/// value of type 4, 64 or 68. The `octets_value` of a binding with a string is null afterwards.
[[nodiscard]] snmp_status snmp_set(snmp_message& message, std::span<snmp_result_slot> results,
                                   const char* address, std::uint32_t mode);

}  // namespace onramp

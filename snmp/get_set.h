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
  snmp_octets* octets = nullptr;  ///< of type 4; `capacity` bounds what is copied
};

/// Asks `address` (see snmp_exchange, also for `mode`) for the bindings of `message`, one for each
/// slot, and copies the reply's values to the slots. Sends a get-next request when `pdu_type` says
/// so, otherwise a get request. A string is followed by a zero byte when the slot has room for one.
/// The bindings' `octets_value` is null afterwards.
///
/// Returns the status of snmp_exchange or else the reply's error status. Returns SNMP_ERR_CODEC
/// when a value has another type than its slot or does not fit there, and when there is no slot for
/// it.
[[nodiscard]] snmp_status snmp_get(snmp_message& message, std::span<snmp_result_slot> results,
                                   const char* address, std::uint32_t mode);

/// Sets the bindings of `message` at `address`. A binding takes its type from the slot that its
/// `index` names, and its value too when that is a string (type 4); any other value is the
/// binding's own. Copies the reply's values to the slots and returns the status as snmp_get does.
///
/// Returns SNMP_ERR_CODEC and sends nothing when the strings, each rounded up to 16 bytes, exceed
/// kReplySize together. A binding's `octets_value` is null afterwards when it held a string.
[[nodiscard]] snmp_status snmp_set(snmp_message& message, std::span<snmp_result_slot> results,
                                   const char* address, std::uint32_t mode);

}  // namespace onramp

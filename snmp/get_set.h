#pragma once

#include <cstdint>
#include <span>

#include "snmp/records.h"
#include "snmp/status.h"

namespace onramp {

/// What the caller of snmp_get or snmp_set expects of one binding, and where its value goes.
struct snmp_result_slot {
  std::uint64_t unused = 0;
  std::uint64_t type = kTagNull;
  std::int64_t int_value = 0;
  snmp_octets* octets = nullptr;  ///< of type 4; `capacity` bounds what is copied
};

/// Asks `address` (see snmp_exchange, also for `mode`) for the bindings of `message`, one for each
/// slot, and copies the reply's values into the slots. Sends a get-next request when `pdu_type`
/// says so, a get request otherwise. A string is followed by a zero byte where the slot has room
/// for it. The bindings' `octets_value` is null afterwards. Answers snmp_exchange's status, or else
/// the reply's error status, or SNMP_ERR_CODEC when a value has another type than its slot, does
/// not fit it, or there is no slot or binding for one.
[[nodiscard]] snmp_status snmp_get(snmp_message& message, std::span<snmp_result_slot> results,
                                   const char* address, std::uint32_t mode);

/// Sets the bindings of `message` at `address`. Binding i takes its type, and a string (type 4) its
/// bytes too, from the slot that the binding's `index` names; other values are the binding's own.
/// The values of the reply are copied into the slots, and the status is answered, as by snmp_get.
/// SNMP_ERR_CODEC, and nothing is sent, when all strings together exceed kReplySize, each of them
/// rounded up to 16 bytes. `octets_value` is null afterwards where it held a string of a slot.
[[nodiscard]] snmp_status snmp_set(snmp_message& message, std::span<snmp_result_slot> results,
                                   const char* address, std::uint32_t mode);

}  // namespace onramp

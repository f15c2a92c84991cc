#pragma once

#include <cstdint>
#include <span>

#include "snmp/records.h"
#include "snmp/status.h"

namespace onramp {

// The program calls neither snmp_get() nor snmp_set(), which are here for completeness.

/// The type that the caller expects for one binding, and the storage for the binding's value.
struct snmp_result_slot {
  std::uint64_t unused = 0;
  std::uint64_t type = kTagNull;
  std::int64_t int_value = 0;     ///< for types 1, 2 and 65 to 67
  snmp_octets* octets = nullptr;  ///< for type 4; the caller's record and storage
};

/// Asks the device at `address` for the objects that the bindings of `message` name, and copies the
/// values in the reply to the slots in `results`. There must be one slot for each binding. Sends a
/// get-next request when `pdu_type` is kPduGetNext, otherwise a get request. snmp_exchange()
/// describes `address` and `mode`. A zero byte follows a copied string if the slot has room for it.
/// Values of types 6, 64 and 68 are not copied; the contents of their slots are undefined. The
/// `octets_value` of each binding is null after the exchange.
///
/// If the exchange fails, returns the status of snmp_exchange(). Otherwise returns the reply's
/// error status, which is 0 on success. Returns SNMP_ERR_CODEC when there are more slots than
/// bindings in the array `varbinds`, and when a value has no slot, has a different type from its
/// slot or does not fit in its slot.
[[nodiscard]] snmp_status snmp_get(snmp_message& message, std::span<snmp_result_slot> results,
                                   const char* address, std::uint32_t mode);

/// Sends the bindings of `message` to the device at `address` in a set request. On entry, each
/// binding's `index` must be the index of its slot in `results`. The binding takes its type from
/// the slot. If the type is 4, the binding also takes its value from the slot; otherwise it keeps
/// its own value. Like snmp_get(), copies the values in the reply to the slots and returns a
/// status. The reply's values go to the slots in order, regardless of `index`.
///
/// A string here is a value of type 4, 64 or 68. The strings are copied to a buffer of kReplySize
/// bytes, where each starts at a multiple of 16. The `octets_value` of a binding with a string is
/// null after the exchange. Returns SNMP_ERR_CODEC and sends nothing when `varbind_count` exceeds
/// the size of the array `varbinds`, when a binding has no slot, when the snmp_octets pointer for a
/// string is null, and when the strings do not fit in the buffer.
[[nodiscard]] snmp_status snmp_set(snmp_message& message, std::span<snmp_result_slot> results,
                                   const char* address, std::uint32_t mode);

}  // namespace onramp

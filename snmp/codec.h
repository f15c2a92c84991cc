#pragma once

#include <cstdint>
#include <span>

#include "snmp/records.h"
#include "snmp/status.h"

namespace onramp {

/// Writes `message` (RFC 1157 section 4) to the start of `out_buffer` and its size to `out_length`.
/// Sets every binding's `encoded_length`. A negative integer is replaced as ber_put_int says, so
/// encoding the same message twice sends -1 first and 255 the second time. A binding whose `type`
/// is not 1, 2, 4, 5, 6 or 64 to 68 is written without a value.
///
/// Returns SNMP_ERR_CODEC when the message does not fit the buffer or 16-bit lengths, when there
/// are more bindings than the array has, when an object identifier has no encoding, and when a
/// value's record is missing. The buffer's content is undefined then.
[[nodiscard]] snmp_status snmp_encode_message(snmp_message& message,
                                              std::span<std::uint8_t> out_buffer,
                                              std::uint16_t& out_length);

/// Fills `message` from a reply. Names, strings and object identifiers are written to the records
/// that the bindings already point to. For names and object identifiers, `count` says on entry how
/// many arcs fit. `message.community` points into `bytes`.
///
/// All strings share one buffer, end to end. On entry every `octets_value->bytes` points to the
/// start of that buffer. On return a string's `bytes` points past the strings before it, and its
/// `capacity` is lower by their size; an integer's or object identifier's `octets_value` is
/// cleared.
///
/// Only the list of bindings is held to its declared length: decoding ends with the first binding
/// that reaches it. The lengths of the message, the PDU and a binding are read and not compared
/// with anything. A value of an unknown type is not skipped: unless it is empty, decoding fails at
/// the next binding.
///
/// Returns SNMP_ERR_CODEC for malformed or missing bytes, and for names, strings or bindings that
/// do not fit. What was decoded until then stays in place. Nothing is ever read beyond `bytes` or
/// written beyond the records' storage.
[[nodiscard]] snmp_status snmp_decode_message(snmp_message& message,
                                              std::span<const std::uint8_t> bytes);

}  // namespace onramp

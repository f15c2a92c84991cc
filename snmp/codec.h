#pragma once

#include <cstdint>
#include <span>

#include "snmp/records.h"
#include "snmp/status.h"

namespace onramp {

/// Encodes `message` (RFC 1157 section 4) at the start of `out_buffer` and stores the size of the
/// encoding in `out_length`. Sets every binding's `encoded_length`. Replaces negative integers in
/// the message as described at ber_put_int. So when a message with the integer -1 is encoded twice,
/// the second encoding contains 255. A binding of an unknown `type` is written without a value; the
/// known types are 1, 2, 4, 5, 6 and 64 to 68.
///
/// Returns SNMP_ERR_CODEC when the message does not fit in the buffer or is longer than 65,535
/// bytes, when `varbind_count` exceeds the size of the array, when an object identifier cannot be
/// encoded, and when the record of a binding's name or value is missing. The buffer's content is
/// then undefined, and integers in the message may have been replaced.
[[nodiscard]] snmp_status snmp_encode_message(snmp_message& message,
                                              std::span<std::uint8_t> out_buffer,
                                              std::uint16_t& out_length);

/// Decodes the reply `bytes` into `message`. Names, strings and object identifiers are written to
/// the records that the bindings already point to. For names and object identifiers, `count` says
/// on entry how many arcs fit. Afterwards `message.community` points into `bytes`.
///
/// All strings share one buffer, end to end. On entry every `octets_value->bytes` points to the
/// start of that buffer. On return a string's `bytes` points past the strings before it, and its
/// `capacity` is reduced by their size. For an integer or an object identifier, the record that
/// `octets_value` points to is reset.
///
/// Decoding ends after the binding that reaches the declared end of the list of bindings. The
/// declared lengths of the message, the PDU and each binding are ignored. The content of a NULL,
/// which should be empty, and the content of a value of unknown type are not skipped. They are read
/// as the next binding, which usually fails.
///
/// Returns SNMP_ERR_CODEC for malformed or missing bytes, and for names, values or bindings that do
/// not fit or whose record is missing. Parts that were decoded before the error stay in `message`.
/// Nothing is ever read beyond `bytes` or written beyond the records' storage.
[[nodiscard]] snmp_status snmp_decode_message(snmp_message& message,
                                              std::span<const std::uint8_t> bytes);

}  // namespace onramp

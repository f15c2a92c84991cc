#pragma once

#include <cstdint>
#include <span>

#include "snmp/records.h"
#include "snmp/status.h"

namespace onramp {

/// Encodes `message` (RFC 1157 section 4) at the start of `out_buffer` and stores its size in
/// `out_length`. Sets every binding's `encoded_length`. Replaces negative integers in the message
/// as described at ber_put_int. So a message that is encoded twice contains -1 the first time and
/// 255 the second time. A binding of an unknown `type` is written without a value; the known types
/// are 1, 2, 4, 5, 6 and 64 to 68.
///
/// Returns SNMP_ERR_CODEC when the message does not fit in the buffer or is longer than 65,535
/// bytes, when `varbind_count` exceeds the size of the array, when an object identifier cannot be
/// encoded, and when the record of a binding's name or value is missing. The buffer's content is
/// then undefined.
[[nodiscard]] snmp_status snmp_encode_message(snmp_message& message,
                                              std::span<std::uint8_t> out_buffer,
                                              std::uint16_t& out_length);

/// Decodes the reply `bytes` into `message`. Names, strings and object identifiers are written to
/// the records that the bindings already point to. For names and object identifiers, `count` says
/// on entry how many arcs fit. `message.community` points into `bytes`.
///
/// All strings share one buffer, end to end. On entry every `octets_value->bytes` points to the
/// start of that buffer. On return a string's `bytes` points past the strings before it, and its
/// `capacity` is reduced by their size. The `octets_value` of an integer or an object identifier is
/// cleared.
///
/// Decoding ends with the first binding that reaches the declared length of the list of bindings.
/// The declared lengths of the message, the PDU and each binding are ignored. The content of a
/// value of an unknown type is not skipped. It is read as the next binding, which usually fails.
///
/// Returns SNMP_ERR_CODEC for malformed or missing bytes, and for names, strings or bindings that
/// do not fit. Parts that were decoded before the error stay in `message`. Nothing is ever read
/// beyond `bytes` or written beyond the records' storage.
[[nodiscard]] snmp_status snmp_decode_message(snmp_message& message,
                                              std::span<const std::uint8_t> bytes);

}  // namespace onramp

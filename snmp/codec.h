#pragma once

#include <cstdint>
#include <span>

#include "snmp/records.h"
#include "snmp/status.h"

namespace onramp {

/// Encodes `message` (RFC 1157 section 4) at the start of `out_buffer` and stores the size of the
/// encoding in `out_length`. Sets the `encoded_length` of each encoded binding. If the `type` of a
/// binding is not 1, 2, 4, 5, 6 or 64 to 68, encodes the binding without a value.
///
/// Changes each negative integer in `message`, except the values of types 65 to 67, to the unsigned
/// number that its encoded bytes stand for (ber_put_int()). For example, -1 is encoded as the byte
/// 255 and becomes 255, so a second call encodes 255.
///
/// Returns SNMP_ERR_CODEC when:
/// - the message does not fit in the buffer or is longer than 65,535 bytes,
/// - `varbind_count` exceeds the size of the array `varbinds`,
/// - an object identifier cannot be encoded, or
/// - a binding's pointer to its name or value is null.
///
/// The buffer's content is then undefined, and negative integers in the message may have been
/// replaced.
[[nodiscard]] snmp_status snmp_encode_message(snmp_message& message,
                                              std::span<std::uint8_t> out_buffer,
                                              std::uint16_t& out_length);

/// Decodes the reply `bytes` into `message`. On entry, the bindings must point to the caller's
/// records for names, strings and object identifiers, and the `count` of each snmp_oid must be the
/// number of arcs that fit. On return, `message.community` points into `bytes`.
///
/// All strings are stored end to end in one buffer. On entry, every `octets_value->bytes` must
/// point to the start of that buffer. On return, the `bytes` of a string points past the strings
/// before it, and its `capacity` is reduced by their size. If a binding's value is an integer or an
/// object identifier, all fields of `*octets_value` are set to zero or null.
///
/// Decoding ends after the binding that reaches the declared end of the list of bindings. The
/// declared lengths of the message, the PDU and each binding are ignored. The content of a NULL or
/// of a value of unknown type is not skipped. If the content is not empty, it is read as the next
/// binding, so decoding usually fails.
///
/// Returns SNMP_ERR_CODEC when:
/// - a function of snmp/ber_reader.h refuses a part, such as an integer of more than four bytes,
/// - an expected tag is missing,
/// - the declared length of the list of bindings exceeds the number of bytes that follow,
/// - the reply has more bindings than fit in the array `varbinds`, or
/// - the record for a name or value is missing or too small. An empty string needs no record.
///
/// Parts that were decoded before the error stay in `message`.
[[nodiscard]] snmp_status snmp_decode_message(snmp_message& message,
                                              std::span<const std::uint8_t> bytes);

}  // namespace onramp

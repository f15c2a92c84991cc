#pragma once

#include <cstdint>
#include <span>

#include "snmp/records.h"
#include "snmp/status.h"

namespace onramp {

/// Encodes `message` (RFC 1157 section 4) at the start of `out_buffer` and stores the size of the
/// encoding in `out_length`. Sets the `encoded_length` of each encoded binding. Replaces each
/// negative integer in `message`, except the values of types 65 to 67, by the unsigned number that
/// has the same bytes (ber_put_int()). For example, -1 becomes 255, and a second encoding contains
/// 255. A binding is written without a value if its `type` is none of 1, 2, 4, 5, 6 and 64 to 68.
///
/// Returns SNMP_ERR_CODEC when the message does not fit in the buffer or is longer than 65,535
/// bytes, when `varbind_count` exceeds the size of the array, when an object identifier cannot be
/// encoded, and when a binding's pointer to its name or value is null. The buffer's content is then
/// undefined, and negative integers in the message may have been replaced.
[[nodiscard]] snmp_status snmp_encode_message(snmp_message& message,
                                              std::span<std::uint8_t> out_buffer,
                                              std::uint16_t& out_length);

/// Decodes the reply `bytes` into `message`. The caller provides the records for names, strings and
/// object identifiers, and the bindings point to them on entry. In each snmp_oid, `count` is on
/// entry the number of arcs that fit. On return, `message.community` points into `bytes`.
///
/// All strings are stored end to end in one buffer. On entry, every `octets_value->bytes` points to
/// the start of that buffer. On return, the `bytes` of a string points past the strings before it,
/// and its `capacity` is reduced by their size. If the value is an integer or an object identifier,
/// the snmp_octets that `octets_value` points to is emptied, and its `bytes` becomes null.
///
/// Decoding ends after the binding that reaches the declared end of the list of bindings. The
/// declared lengths of the message, the PDU and each binding are ignored. The content of a value of
/// unknown type is not skipped but read as the next binding, so decoding usually fails. The same
/// applies to a NULL that has content.
///
/// Returns SNMP_ERR_CODEC for bytes that the functions of snmp/ber_reader.h refuse, such as an
/// integer of more than four bytes, and for bytes in which an expected tag is missing or a list of
/// bindings is declared longer than the bytes that follow. Also returns it when the reply has more
/// bindings than the array, and when the record for a name or value is missing or too small. An
/// empty string needs no record. Parts that were decoded before the error stay in `message`.
[[nodiscard]] snmp_status snmp_decode_message(snmp_message& message,
                                              std::span<const std::uint8_t> bytes);

}  // namespace onramp

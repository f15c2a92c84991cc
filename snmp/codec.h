#pragma once

#include <cstdint>
#include <span>

#include "snmp/records.h"
#include "snmp/status.h"

namespace onramp {

/// Writes `message` (RFC 1157 section 4) into `out_buffer` and its size into `out_length`. Sets
/// every binding's `encoded_length` and masks negative integers in place, see ber_int_size. A
/// binding whose `type` is none of 1, 2, 4, 5, 6 and 64 to 68 is written without a value.
/// SNMP_ERR_CODEC when the message does not fit the buffer or a 16-bit length, when there are more
/// bindings than the array has, when an object identifier cannot be encoded or when a value's
/// record is missing; then nothing is written.
[[nodiscard]] snmp_status snmp_encode_message(snmp_message& message,
                                              std::span<std::uint8_t> out_buffer,
                                              std::uint16_t& out_length);

/// Fills `message` from a reply. Names, strings and object identifiers go to the records that the
/// bindings already point at, for names and object identifiers with `count` as the room. The
/// bindings' strings lie end to end in one buffer: every `octets_value` comes with `bytes` at its
/// start, and leaves with `bytes` moved past the strings before its own and `capacity` lowered as
/// much; the one of an integer or an object identifier leaves cleared. `community` points into
/// `bytes`. A value of a type that the encoder does not know is not skipped, so that only an empty
/// one can be followed by another binding.
///
/// SNMP_ERR_CODEC for anything malformed, for an element that is longer than what encloses it, and
/// for names, strings or bindings beyond the room for them; what was decoded until then stays in
/// place, and nothing is ever written beyond that room.
[[nodiscard]] snmp_status snmp_decode_message(snmp_message& message,
                                              std::span<const std::uint8_t> bytes);

}  // namespace onramp

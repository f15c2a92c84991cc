#pragma once

#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

#include "snmp/codec.h"

namespace onramp {

/// Returns the bytes that the hexadecimal digits in `text` encode. Spaces are ignored.
inline std::vector<std::uint8_t> hex(std::string_view text) {
  std::vector<std::uint8_t> bytes;
  int digits = 0;
  for (const char c : text) {
    if (c == ' ') continue;
    const auto digit = static_cast<std::uint8_t>(c <= '9' ? c - '0' : (c | 0x20) - 'a' + 10);
    if (digits++ % 2 == 0) bytes.push_back(0);
    bytes.back() = static_cast<std::uint8_t>(bytes.back() << 4 | digit);
  }
  return bytes;
}

/// Returns net-snmp's reply to request 7, which asks for ActiveIF. The value is 2.
inline std::vector<std::uint8_t> realReply() {
  return hex(
      "30 30 02 01 00 04 08 63 6f 72 72 69 64 6f 72 a2 21 02 01 07 02 01 00 02 01 00 30 16 30 14 "
      "06 0f 2b 06 01 04 01 a1 12 02 04 04 89 58 01 02 00 02 01 02");
}

/// Returns the bytes of a reply to request 7. `bindings` is the hexadecimal text of the reply's
/// bindings, at most 255 bytes. The reply declares some lengths as 0, but the decoder ignores these
/// lengths.
inline std::vector<std::uint8_t> replyWith(std::string_view bindings, std::uint8_t errorStatus = 0,
                                           std::uint8_t errorIndex = 0) {
  const auto list = hex(bindings);
  auto reply = hex("30 00 02 01 00 04 00 a2 00 02 01 07 02 01 00 02 01 00 30 81 00");
  reply[14] = errorStatus;
  reply[17] = errorIndex;
  reply.back() = static_cast<std::uint8_t>(list.size());
  reply.insert(reply.end(), list.begin(), list.end());
  return reply;
}

/// A request, and the storage for a reply. Each of the `bindings` bindings has the name 1.3.1.1…
/// and the value NULL. Each name has room for `arcsEach` arcs. All strings share `stringBytes`
/// bytes. The heap blocks have no spare room, so the sanitizers report an access past their end.
struct Message {
  explicit Message(std::size_t bindings, std::uint16_t arcsEach = 14,
                   std::uint16_t stringBytes = 1500)
      : room(arcsEach), stringRoom(stringBytes), names(bindings), oids(bindings), octets(bindings) {
    arcs.assign(2 * bindings * room, 1);
    for (std::size_t name = 1; name < arcs.size(); name += room)
      arcs[name] = 3;
    strings.assign(stringRoom, 0);
    varbinds.resize(bindings);
    message.varbinds = varbinds;
    snmp_message_init(message, bindings);
    message.request_id = 7;
    reset();
  }
  Message(const Message&) = delete;
  Message& operator=(const Message&) = delete;
  ~Message() = default;

  void reset() {
    for (std::size_t i = 0; i < varbinds.size(); ++i) {
      names[i] = {room, room, arcs.data() + 2 * i * room};
      oids[i] = {room, room, arcs.data() + (2 * i + 1) * room};
      octets[i] = {stringRoom, stringRoom, strings.data()};
      varbinds[i].name = &names[i];
      varbinds[i].oid_value = &oids[i];
      varbinds[i].octets_value = &octets[i];
    }
  }

  snmp_status decode(std::span<const std::uint8_t> bytes) {
    reset();
    return snmp_decode_message(message, bytes);
  }

  std::vector<std::uint8_t> encode(std::size_t buffer = 70000) {
    std::vector<std::uint8_t> bytes(buffer);
    std::uint16_t length = 0;
    if (snmp_encode_message(message, bytes, length)) return {};
    bytes.resize(length);
    return bytes;
  }

  std::uint16_t room;
  std::uint16_t stringRoom;
  std::vector<std::uint16_t> arcs;
  std::vector<std::uint8_t> strings;
  std::vector<snmp_oid> names;
  std::vector<snmp_oid> oids;
  std::vector<snmp_octets> octets;
  std::vector<snmp_varbind> varbinds;
  snmp_message message;
};

}  // namespace onramp

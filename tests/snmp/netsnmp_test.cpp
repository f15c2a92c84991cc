// What the encoder writes, read by net-snmp's library.

#include <gtest/gtest.h>
#include <net-snmp/net-snmp-config.h>
#include <net-snmp/net-snmp-includes.h>

#include <memory>
#include <numeric>

#include "tests/snmp/message.h"

namespace onramp {

namespace {

using Pdu = std::unique_ptr<netsnmp_pdu, decltype(&snmp_free_pdu)>;

Pdu parsedByNetSnmp(std::vector<std::uint8_t> bytes) {
  netsnmp_session session{};
  snmp_sess_init(&session);
  session.version = SNMP_VERSION_1;
  Pdu pdu(snmp_pdu_create(SNMP_MSG_RESPONSE), &snmp_free_pdu);
  if (bytes.empty() || snmp_parse(nullptr, &session, pdu.get(), bytes.data(), bytes.size()) != 0) {
    pdu.reset();
  }
  return pdu;
}

bool sameArcs(const snmp_oid& ours, const oid* theirs, std::size_t count) {
  return std::equal(ours.arcs, ours.arcs + ours.count, theirs, theirs + count);
}

TEST(NetSnmpReads, TheRequestOfTheProgram) {
  Message m(1);
  ASSERT_EQ(m.decode(realReply()), SNMP_OK);
  snmp_message_init(m.message, 1);
  m.message.pdu_type = kPduSet;
  EXPECT_EQ(
      m.encode(),
      hex("30 2f 02 01 00 04 08 63 6f 72 72 69 64 6f 72 a3 20 02 01 07 02 01 00 02 01 00 30 15 "
          "30 13 06 0f 2b 06 01 04 01 a1 12 02 04 04 89 58 01 02 00 05 00"));
  EXPECT_EQ(m.varbinds[0].encoded_length, 19);
  EXPECT_TRUE(parsedByNetSnmp(m.encode()));
  snmp_message_init(m.message, 0);
  const auto empty = m.encode();
  EXPECT_EQ(std::vector(empty.end() - 2, empty.end()), hex("30 00"));
}

TEST(NetSnmpReads, EveryIntegerOfEveryTypeAndKindOfRequest) {
  for (int bit = 0; bit <= 32; ++bit) {
    for (const std::int64_t near : {-1, 0, 1}) {
      for (const std::int64_t sign : {1, -1}) {
        for (const std::uint8_t type : {kTagInteger, kTagCounter, kTagGauge, kTagTimeTicks}) {
          const std::int64_t value = sign * ((std::int64_t{1} << bit) + near);
          Message m(1);
          m.varbinds[0].type = type;
          m.varbinds[0].int_value = value;
          m.message.pdu_type = type & 3U;
          m.message.request_id = static_cast<std::uint64_t>(value);
          const Pdu pdu = parsedByNetSnmp(m.encode());
          ASSERT_TRUE(pdu) << value;
          EXPECT_EQ(pdu->command, 0xA0 | (type & 3));
          EXPECT_EQ(pdu->reqid, static_cast<std::int32_t>(value));
          EXPECT_EQ(pdu->variables->type, type);
          EXPECT_EQ(static_cast<std::int32_t>(*pdu->variables->val.integer),
                    static_cast<std::int32_t>(value));
          EXPECT_EQ(*pdu->variables->val.integer < 0, type == kTagInteger && pdu->reqid < 0);
        }
      }
    }
  }
}

TEST(NetSnmpReads, StringsAndMessagesOfEveryLength) {
  std::size_t longest = 0;
  Message m(1, 14, 65535);
  std::iota(m.strings.begin(), m.strings.end(), std::uint8_t{0});
  m.varbinds[0].type = kTagOpaque;
  for (std::uint16_t length = 0; length != UINT16_MAX; length == 600 ? length = 65400 : ++length) {
    m.octets[0].length = length;
    const auto bytes = m.encode();
    if (bytes.empty()) continue;
    const Pdu pdu = parsedByNetSnmp(bytes);
    ASSERT_TRUE(pdu) << length;
    ASSERT_EQ(pdu->variables->val_len, length);
    ASSERT_TRUE(
        std::equal(m.strings.begin(), m.strings.begin() + length, pdu->variables->val.string));
    longest = bytes.size();
  }
  EXPECT_EQ(longest, 65535U);
}

TEST(NetSnmpReads, ObjectIdentifiersAtEveryBoundary) {
  for (const std::uint16_t arc : std::vector<std::uint16_t>{0, 127, 128, 16383, 16384, 65535}) {
    for (std::uint16_t count = 2; count <= 128; ++count) {
      Message m(1, 128);
      std::vector<std::uint16_t> arcs(count, arc);
      arcs[0] = 1;
      arcs[1] = 3;
      Message::set(m.names[0], arcs);
      Message::set(m.oids[0], arcs);
      m.varbinds[0].type = kTagObjectIdentifier;
      const auto bytes = m.encode();
      const std::size_t content = 1 + (count - 2U) * (arc < 128 ? 1U : arc < 16384 ? 2U : 3U);
      ASSERT_EQ(bytes.empty(), content > 255) << content;
      if (bytes.empty()) continue;
      const Pdu pdu = parsedByNetSnmp(bytes);
      ASSERT_TRUE(pdu) << arc << " x " << count;
      EXPECT_TRUE(sameArcs(m.names[0], pdu->variables->name, pdu->variables->name_length));
      EXPECT_TRUE(
          sameArcs(m.oids[0], pdu->variables->val.objid, pdu->variables->val_len / sizeof(oid)));
    }
  }
}

TEST(NetSnmpReads, ManyBindingsAndSoDoesTheDecoder) {
  Message m(257);
  for (std::size_t i = 0; i < 257; ++i) {
    m.names[i].arcs[2] = static_cast<std::uint16_t>(i * 250);
    m.varbinds[i].type = kTagIpAddress;
    m.octets[i].length = 4;
  }
  const auto bytes = m.encode();
  const Pdu pdu = parsedByNetSnmp(bytes);
  ASSERT_TRUE(pdu);
  std::size_t i = 0;
  for (const netsnmp_variable_list* v = pdu->variables; v; v = v->next_variable)
    EXPECT_TRUE(sameArcs(m.names[i++], v->name, v->name_length));
  EXPECT_EQ(i, 257U);
  EXPECT_EQ(Message(257).decode(bytes), SNMP_OK);
  EXPECT_EQ(Message(256).decode(bytes), SNMP_ERR_CODEC);
}

}  // namespace

}  // namespace onramp

// What the encoder writes, read by net-snmp's library.

#include <gtest/gtest.h>
#include <net-snmp/net-snmp-config.h>
#include <net-snmp/net-snmp-includes.h>

#include <memory>
#include <numeric>
#include <set>

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

TEST(NetSnmpReads, EveryIntegerOfEveryType) {
  for (int bit = 0; bit <= 32; ++bit) {
    for (const std::int64_t near : {-1, 0, 1}) {
      for (const std::int64_t sign : {1, -1}) {
        for (const std::uint8_t type : {kTagInteger, kTagCounter, kTagGauge, kTagTimeTicks}) {
          const std::int64_t value = sign * ((std::int64_t{1} << bit) + near);
          Message m(1);
          m.varbinds[0].type = type;
          m.varbinds[0].int_value = value;
          const Pdu pdu = parsedByNetSnmp(m.encode());
          ASSERT_TRUE(pdu) << value;
          EXPECT_EQ(pdu->variables->type, type);
          const long read = *pdu->variables->val.integer;
          if (type == kTagInteger) {
            EXPECT_EQ(read, static_cast<std::int32_t>(value));
          } else {
            EXPECT_EQ(read, static_cast<std::uint32_t>(value));
          }
        }
      }
    }
  }
}

TEST(NetSnmpReads, TheFieldsOfEveryKindOfRequest) {
  for (const std::uint64_t kind : {kPduGet, kPduGetNext, kPduSet}) {
    for (const std::int64_t id : {0, 127, 128, 65536, INT32_MAX, -1, -129, -70000, INT32_MIN}) {
      Message m(1);
      m.message.pdu_type = kind;
      m.message.request_id = static_cast<std::uint64_t>(id);
      const Pdu pdu = parsedByNetSnmp(m.encode());
      ASSERT_TRUE(pdu);
      EXPECT_EQ(pdu->command, static_cast<int>(0xA0 | kind));
      EXPECT_EQ(pdu->reqid, id);
      EXPECT_EQ(std::string(reinterpret_cast<const char*>(pdu->community), pdu->community_len),
                "corridor");
      EXPECT_EQ(pdu->variables->type, ASN_NULL);
    }
  }
}

TEST(NetSnmpReads, StringsAndMessagesOfEveryLength) {
  std::vector<std::uint16_t> lengths(600);
  std::iota(lengths.begin(), lengths.end(), std::uint16_t{0});
  for (std::uint16_t length = 65400; length != 0; ++length)
    lengths.push_back(length);
  for (const std::uint8_t type : {kTagOctetString, kTagOpaque}) {
    std::set<std::size_t> sizes;
    Message m(1, 14, 65535);
    std::iota(m.strings.begin(), m.strings.end(), std::uint8_t{0});
    m.varbinds[0].type = type;
    for (const std::uint16_t length : lengths) {
      m.octets[0].length = length;
      const auto bytes = m.encode();
      if (bytes.empty()) continue;
      const Pdu pdu = parsedByNetSnmp(bytes);
      ASSERT_TRUE(pdu) << length;
      ASSERT_EQ(pdu->variables->val_len, length);
      ASSERT_TRUE(
          std::equal(m.strings.begin(), m.strings.begin() + length, pdu->variables->val.string));
      sizes.insert(bytes.size());
    }
    for (const std::size_t size : {127U, 128U, 255U, 256U, 65535U})
      EXPECT_EQ(sizes.count(size), 1U) << size;
    EXPECT_EQ(*sizes.rbegin(), 65535U);
  }
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

TEST(NetSnmpReads, AnAddressAmongManyBindings) {
  Message m(257, 14);
  for (std::size_t i = 0; i < 257; ++i) {
    Message::set(m.names[i], std::vector<std::uint16_t>{1, 3, static_cast<std::uint16_t>(i * 250)});
    m.varbinds[i].type = kTagIpAddress;
    m.octets[i].length = 4;
  }
  const Pdu pdu = parsedByNetSnmp(m.encode());
  ASSERT_TRUE(pdu);
  std::size_t i = 0;
  for (const netsnmp_variable_list* v = pdu->variables; v; v = v->next_variable, ++i) {
    EXPECT_EQ(v->type, ASN_IPADDRESS);
    EXPECT_TRUE(sameArcs(m.names[i], v->name, v->name_length));
  }
  EXPECT_EQ(i, 257U);
}

}  // namespace

}  // namespace onramp

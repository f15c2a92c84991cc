// What the encoder writes, read by net-snmp's library.

#include <gtest/gtest.h>
#include <net-snmp/net-snmp-config.h>
#include <net-snmp/net-snmp-includes.h>

#include <memory>

#include "tests/snmp/message.h"

namespace onramp {

namespace {

// What net-snmp reads in a message: its kind, its number, and the type and value of its bindings.
std::string readByNetSnmp(std::vector<std::uint8_t> bytes) {
  netsnmp_session session{};
  snmp_sess_init(&session);
  session.version = SNMP_VERSION_1;
  const std::unique_ptr<netsnmp_pdu, decltype(&snmp_free_pdu)> pdu(
      snmp_pdu_create(SNMP_MSG_RESPONSE), &snmp_free_pdu);
  if (snmp_parse(nullptr, &session, pdu.get(), bytes.data(), bytes.size()) != 0) return "refused";
  std::string text = std::to_string(pdu->command) + ' ' + std::to_string(pdu->reqid);
  for (const netsnmp_variable_list* v = pdu->variables; v; v = v->next_variable) {
    text += " | " + std::to_string(v->type);
    const bool isArcs = v->type == ASN_OBJECT_ID;
    if (v->type == ASN_OCTET_STR || v->type == ASN_IPADDRESS || v->type == ASN_OPAQUE) {
      text += ' ' + std::string(v->val.string, v->val.string + v->val_len);
    } else if (v->type != ASN_NULL) {
      for (std::size_t i = 0; i < (isArcs ? v->val_len / sizeof(oid) : 1); ++i)
        text += ' ' + std::to_string(isArcs ? static_cast<long>(v->val.objid[i]) : *v->val.integer);
    }
  }
  return text;
}

TEST(NetSnmpReads, TheRequestOfTheProgram) {
  Message m(1);
  ASSERT_EQ(m.decode(realReply()), SNMP_OK);
  snmp_message_init(m.message, 1);
  m.message.pdu_type = kPduSet;
  const auto request =
      hex("30 2f 02 01 00 04 08 63 6f 72 72 69 64 6f 72 a3 20 02 01 07 02 01 00 02 01 00 30 15 "
          "30 13 06 0f 2b 06 01 04 01 a1 12 02 04 04 89 58 01 02 00 05 00");
  EXPECT_EQ(m.encode(), request);
  EXPECT_EQ(m.varbinds[0].encoded_length, 19);
  EXPECT_EQ(readByNetSnmp(request), "163 7 | 5");
  snmp_message_init(m.message, 0);
  EXPECT_EQ(readByNetSnmp(m.encode()), "163 7");
}

TEST(NetSnmpReads, EveryTypeOfValue) {
  const std::uint16_t arcs[] = {1, 3, 127, 128, 16383, 16384, 65535};
  const std::uint8_t types[] = {2, 65, 66, 67, 2, 4, 64, 68, 6, 5};
  Message m(std::size(types), std::size(arcs));
  for (std::size_t i = 0; i < std::size(types); ++i) {
    m.varbinds[i].type = types[i];
    m.varbinds[i].int_value = i == 4 ? -129 : std::int64_t{1} << (30 + i % 3);
    m.octets[i].length = 4;
    std::copy(std::begin(arcs), std::end(arcs), m.oids[i].arcs);
  }
  std::fill_n(m.strings.begin(), 4, 'x');
  m.message.request_id = UINT32_MAX;
  m.message.pdu_type = kPduGetNext;
  EXPECT_EQ(readByNetSnmp(m.encode()),
            "161 -1 | 2 1073741824 | 65 2147483648 | 66 0 | 67 1073741824 | 2 -129 | 4 xxxx | "
            "64 xxxx | 68 xxxx | 6 1 3 127 128 16383 16384 65535 | 5");
}

TEST(NetSnmpReads, StringsAndMessagesOfEveryLength) {
  std::size_t longest = 0;
  Message m(1, 14, 65535);
  m.varbinds[0].type = kTagOpaque;
  for (std::uint16_t length = 0; length != UINT16_MAX; length == 600 ? length = 65400 : ++length) {
    m.octets[0].length = length;
    const auto bytes = m.encode();
    if (bytes.empty()) continue;
    const auto end = m.strings.begin() + length;
    ASSERT_EQ(readByNetSnmp(bytes), "160 7 | 68 " + std::string(m.strings.begin(), end)) << length;
    longest = bytes.size();
  }
  EXPECT_EQ(longest, 65535U);
}

}  // namespace

}  // namespace onramp

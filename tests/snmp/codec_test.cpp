#include <gmock/gmock.h>
#include <net-snmp/net-snmp-config.h>
#include <net-snmp/net-snmp-includes.h>

#include <algorithm>
#include <array>
#include <memory>

#include "snmp/ber_reader.h"
#include "snmp/ber_writer.h"
#include "snmp/protocol.h"
#include "tests/snmp/message.h"

namespace onramp {

namespace {

template <typename Put>
std::vector<std::uint8_t> written(Put put) {
  std::vector<std::uint8_t> bytes(1000);
  ber_writer out(bytes);
  if (put(out) != SNMP_OK) return {};
  return {bytes.end() - static_cast<std::ptrdiff_t>(out.size()), bytes.end()};
}

TEST(Integers, TakeTheFewestBytesAndAreSignExtendedDependingOnTheirSize) {
  // Each row has a number, its encoding, and the numbers that ber_get_int() and ber_get_uint() read
  // from the encoding. ber_put_int() sets its argument to the row's last number.
  const std::tuple<std::int64_t, const char*, std::int64_t, std::uint64_t> cases[] = {
      {127, "02 01 7F", 127, 127},
      {128, "02 02 00 80", 128, 128},
      {0x8000, "02 03 00 80 00", 0x8000, 0x8000},
      {0x800000, "02 04 00 80 00 00", 0x800000, 0x800000},
      {INT32_MAX, "02 04 7F FF FF FF", INT32_MAX, INT32_MAX},
      {-128, "02 01 80", -128, 0x80},
      {-129, "02 02 FF 7F", -129, 0xFF7F},
      {-32768, "02 02 80 00", -32768, 0x8000},
      {-32769, "02 03 FF 7F FF", 0xFFFF7FFF, 0xFF7FFF},
      {-0x800000, "02 03 80 00 00", 0xFF800000, 0x800000},
      {-0x800001, "02 04 FF 7F FF FF", 0xFF7FFFFF, 0xFF7FFFFF},
  };
  for (const auto& [number, text, read, readAsUnsigned] : cases) {
    std::int64_t value = number;
    const auto bytes = hex(text);
    EXPECT_EQ(written([&](ber_writer& out) { return ber_put_int(out, value, 2); }), bytes);
    EXPECT_EQ(static_cast<std::uint64_t>(value), readAsUnsigned);
    ByteReader in{std::span<const std::uint8_t>(bytes).subspan(2)};
    ByteReader again = in;
    std::uint64_t asUnsigned = 0;
    EXPECT_EQ(ber_get_int(in, value, bytes[1]), SNMP_OK);
    EXPECT_EQ(ber_get_uint(again, asUnsigned, bytes[1]), SNMP_OK);
    EXPECT_EQ(value, read);
    EXPECT_EQ(asUnsigned, readAsUnsigned);
  }
  EXPECT_EQ(written([](ber_writer& out) { return ber_put_uint(out, 0x80000000, 0x42); }),
            hex("42 05 00 80 00 00 00"));
}

TEST(Lengths, HaveExactlyThreeForms) {
  const std::pair<std::uint16_t, const char*> forms[] = {{0, "00"},         {127, "7F"},
                                                         {128, "81 80"},    {255, "81 FF"},
                                                         {256, "82 01 00"}, {65535, "82 FF FF"}};
  std::uint16_t read = 1;
  for (const auto& form : forms) {
    const auto bytes = hex(form.second);
    EXPECT_EQ(written([&](ber_writer& out) { return ber_put_length(out, form.first); }), bytes);
    ByteReader in(bytes);
    EXPECT_EQ(ber_get_length(in, read), SNMP_OK);
    EXPECT_EQ(read, form.first);
  }
  for (const char* const refused : {"", "80", "81", "82 01", "83 00 00 01", "84 DE AD BA BE"}) {
    const auto bytes = hex(refused);
    ByteReader in(bytes);
    EXPECT_EQ(ber_get_length(in, read), SNMP_ERR_CODEC) << refused;
  }
}

TEST(ObjectIdentifiers, PackTheFirstTwoArcsInOneByteAndHaveAtMost255BytesOfContent) {
  const auto put = [](std::vector<std::uint16_t> arcs) {
    const auto count = static_cast<std::uint16_t>(arcs.size());
    return written([&](ber_writer& out) { return ber_put_oid(out, {count, count, arcs.data()}); });
  };
  EXPECT_EQ(put({6, 15}), hex("06 01 FF"));
  EXPECT_TRUE(put({6, 16}).empty()) << "6 x 40 + 16 does not fit in a byte";
  EXPECT_TRUE(put({1}).empty());
  EXPECT_EQ(put(std::vector<std::uint16_t>(256, 1)).size(), 258U);
  EXPECT_TRUE(put(std::vector<std::uint16_t>(257, 1)).empty());

  const auto bytes = hex("2B 05");
  std::uint16_t arcs[] = {9, 9, 9};
  for (std::uint16_t room = 0; room < 3; ++room) {
    snmp_oid target{room, room, arcs};
    ByteReader in(bytes);
    EXPECT_EQ(ber_get_oid(in, &target, 2), SNMP_ERR_CODEC);
    EXPECT_EQ(arcs[room], 9) << "no arc is written past the storage";
  }
}

TEST(UnusedPrimitives, KeepTheirContracts) {
  std::uint16_t a[] = {1, 3, 6}, b[] = {1, 3, 7};
  EXPECT_EQ(snmp_oid_compare({3, 3, a}, {3, 3, b}), -1);
  EXPECT_EQ(snmp_oid_compare({3, 3, b}, {3, 3, a}), 1);
  EXPECT_EQ(snmp_oid_compare({2, 2, a}, {3, 3, b}), -1);
  EXPECT_EQ(snmp_oid_compare({3, 3, a}, {2, 2, b}), 0);

  const auto bytes = hex("1F 62 63");
  snmp_octets target{9, 2, nullptr};
  ByteReader in(bytes);
  EXPECT_EQ(ber_get_octets_ref(in, &target, 4), SNMP_ERR_CODEC);
  EXPECT_EQ(ber_get_octets_ref(in, &target, 3), SNMP_OK);
  EXPECT_EQ(target.bytes, bytes.data());
  EXPECT_EQ(target.capacity, 0) << "nothing may be written to the input";
}

TEST(Decoding, ReadsARealReplyInPlaceAndRefusesATruncatedOne) {
  const auto reply = realReply();
  Message m(1);
  for (std::size_t length = 0; length < reply.size(); ++length)
    EXPECT_EQ(m.decode(std::span(reply).first(length)), SNMP_ERR_CODEC) << length;
  ASSERT_EQ(m.decode(reply), SNMP_OK);
  EXPECT_EQ(m.message.community, reinterpret_cast<const char*>(reply.data() + 7));
  EXPECT_EQ(m.message.community_length, 8);
  EXPECT_THAT((std::array{m.message.version, m.message.pdu_type, m.message.request_id}),
              testing::ElementsAre(0U, kPduResponse, 7U));
  EXPECT_EQ(m.varbinds[0].int_value, 2);
  EXPECT_THAT(std::span(m.names[0].arcs, m.names[0].count),
              testing::ElementsAreArray(kActiveIFObject));

  ASSERT_EQ(m.decode(replyWith("30 0B 06 05 2b 06 01 04 01 05 00", 2, 1)), SNMP_OK);
  EXPECT_EQ(m.message.error_status, 2U);
  EXPECT_EQ(m.message.error_index, 1U);
  EXPECT_EQ(m.names[0].count, 6);
  EXPECT_EQ(snmp_decode_message(m.message, reply), SNMP_ERR_CODEC)
      << "the name has 14 arcs, but only 6 fit";
}

TEST(Decoding, AcceptsEveryFormOfValue) {
  const std::pair<const char*, const char*> cases[] = {
      // Each row has an encoded value and the decoded type, number, count of arcs, and string.
      // "cleared" is a null string, and "####" an unchanged one.
      {"01 01 FF", "1 -1 4 cleared"},
      {"02 02 80 00", "2 -32768 4 cleared"},
      {"41 03 80 00 01", "65 4286578689 4 cleared"},
      {"42 01 05", "66 5 4 cleared"},
      {"43 04 80 00 00 00", "67 2147483648 4 cleared"},
      {"06 03 2B 06 01", "6 0 4 cleared"},
      {"06 00", "6 0 0 cleared"},
      {"04 81 03 61 62 63", "4 0 4 abc"},
      {"04 00", "4 0 4 "},
      {"40 04 61 61 61 61", "64 0 4 aaaa"},
      {"44 02 78 79", "68 0 4 xy"},
      {"05 00", "5 0 4 ####"},
      {"82 00", "130 0 4 ####"},
      {"47 02", "71 0 4 ####"},
  };
  for (const auto& [value, outcome] : cases) {
    Message m(1, 4, 4);
    m.strings.assign(m.strings.size(), '#');
    ASSERT_EQ(m.decode(replyWith("30 00 06 01 2B" + std::string(value))), SNMP_OK) << value;
    std::string text = std::to_string(m.varbinds[0].type) + ' ';
    text += std::to_string(m.varbinds[0].int_value) + ' ' + std::to_string(m.oids[0].count) + ' ';
    const auto& [length, capacity, bytes] = m.octets[0];
    EXPECT_EQ(text + (bytes ? std::string(bytes, bytes + length) : "cleared"), outcome);
    EXPECT_EQ(capacity, bytes ? 4 : 0);
  }
}

TEST(Decoding, StoresStringsEndToEndAndNeverPastTheirBuffer) {
  const auto reply = replyWith(
      "30 00 06 01 2B 04 03 61 62 63  30 00 06 01 2B 02 01 05  30 00 06 01 2B 40 04 64 65 66 67"
      "30 00 06 01 2B 44 02 78 79");
  for (std::uint16_t room = 0; room < 12; ++room) {
    Message m(4, 14, room);
    EXPECT_EQ(m.decode(reply), room < 9 ? SNMP_ERR_CODEC : SNMP_OK) << room;
    if (room < 9) continue;
    EXPECT_EQ(std::string(m.strings.begin(), m.strings.begin() + 9), "abcdefgxy");
    EXPECT_EQ(m.octets[3].bytes, m.strings.data() + 7);
    EXPECT_EQ(m.octets[3].capacity, room - 7);
    EXPECT_EQ(m.varbinds[3].index, 3U);
    const auto last = static_cast<std::uint16_t>(room - 9);  // the bytes left after the first nine
    m.reset();
    m.octets[3] = {last, last, m.strings.data() + 9};
    EXPECT_EQ(snmp_decode_message(m.message, reply), SNMP_ERR_CODEC) << room;
  }
}

TEST(Decoding, RefusesMalformedOrOversizedMessagesAndAcceptsTheRest) {
  const std::string head = "02 01 00 04 00", pdu = "02 01 07 02 01 00 02 01 00",
                    bindings = "30 00 06 01 2B 05 00 30 00 06 01 2B 02 01 02",
                    list = head + "a2 1A" + pdu + "30";
  // Each row ends with the number of decoded bindings, or -1 if the message is refused.
  const std::tuple<const char*, std::vector<std::uint8_t>, std::int64_t> cases[] = {
      {"stated lengths of message and PDU too small",
       hex("30 00" + head + "a2 01" + pdu + "30 0F" + bindings), 2},
      {"long forms", hex("30 82 FF FF" + head + "a2 81 7F" + pdu + "30 81 00"), 0},
      {"list ends inside a binding", hex("30 21" + list + "0E" + bindings), 2},
      {"list ends after a binding", hex("30 21" + list + "07" + bindings), 1},
      {"list beyond the input", hex("30 21" + list + "10" + bindings), -1},
      {"four-byte integer", hex("30 00 02 04 00 00 00 00 04 00 a2 00" + pdu + "30 00"), 0},
      {"five-byte integer", hex("30 00 02 05 00 00 00 00 00 04 00 a2 00" + pdu + "30 00"), -1},
      {"integer without content", hex("30 00 02 00 04 00 a2 00" + pdu + "30 00"), -1},
      {"community beyond the input", hex("30 00 02 01 00 04 7F a2 00" + pdu + "30 00"), -1},
      {"high tag number of a PDU", hex("30 21" + head + "bf 1A" + pdu + "30 00"), -1},
      {"indefinite length", hex("30 80" + head + "a2 80" + pdu + "30 00 00 00"), -1},
      {"zeros, as after a time-out", hex("00 00 00 00"), -1},
      {"as many arcs as fit", replyWith("30 7F 06 03 2B 06 01 05 00"), 1},
      {"one arc too many", replyWith("30 00 06 04 2B 06 01 04 05 00"), -1},
      {"largest arc", replyWith("30 00 06 04 2B 83 FF 7F 05 00"), 1},
      {"arc above 16 bits", replyWith("30 00 06 04 2B 84 80 00 05 00"), -1},
      {"arc that wraps 32 bits", replyWith("30 00 06 07 2B 90 80 80 80 80 01 05 00"), -1},
      {"arc without an end", replyWith("30 00 06 03 2B 06 81 05 00"), -1},
      {"name beyond the input", replyWith("30 00 06 7F 2B 06 01 05 00"), -1},
      {"unsigned of five bytes", replyWith("30 00 06 01 2B 42 05 00 FF FF FF FF"), -1},
      {"string beyond the input", replyWith("30 00 06 01 2B 04 02 61"), -1},
      {"no value", replyWith("30 00 06 01 2B"), -1},
      {"empty unknown type", replyWith("30 00 06 01 2B 82 00" + bindings.substr(0, 20)), 2},
      {"unknown type", replyWith("30 00 06 01 2B 47 01 05" + bindings.substr(0, 20)), -1},
      {"more bindings than fit", replyWith(bindings + bindings), -1},
  };
  for (const auto& [what, bytes, count] : cases) {
    Message m(2, 4);
    const bool decoded = m.decode(bytes) == SNMP_OK;
    EXPECT_EQ(decoded ? static_cast<std::int64_t>(m.message.varbind_count) : -1, count) << what;
  }
}

TEST(Encoding, RefusesMessagesThatExceedTheBufferOr16BitLengths) {
  Message m(1, 2, 65535);
  m.varbinds[0].type = kTagOctetString;
  const std::size_t size = m.encode().size();
  for (std::size_t room = 0; room < size; ++room)
    EXPECT_TRUE(m.encode(room).empty());
  EXPECT_EQ(m.encode(size).size(), size);
  std::size_t longest = 0;
  for (std::uint16_t length = 65400; length != 0; ++length) {
    m.octets[0].length = length;
    longest = std::max(longest, m.encode().size());
  }
  EXPECT_EQ(longest, 65535U);
  m.octets[0].length = 0;
  m.message.varbind_count = 2;
  EXPECT_TRUE(m.encode().empty()) << "the array has only one binding";
  m.message.varbind_count = 1;
  m.varbinds[0].octets_value = nullptr;
  EXPECT_TRUE(m.encode().empty());
}

// Returns what net-snmp reads from a message: the PDU's type, the request identifier, and the type
// and value of each binding. Returns "refused" when net-snmp cannot read the message.
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

TEST(NetSnmpReads, RequestsWithAndWithoutABinding) {
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

TEST(NetSnmpReads, EveryValueTypeOfSNMPv1) {
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

}  // namespace

}  // namespace onramp

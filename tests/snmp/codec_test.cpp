#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "tests/snmp/message.h"

namespace onramp {

namespace {

TEST(Decoding, ReadsARealReplyInPlace) {
  const auto reply = realReply();
  Message m(1);
  ASSERT_EQ(m.decode(reply), SNMP_OK);
  EXPECT_EQ(m.message.version, 0U);
  EXPECT_EQ(std::string(m.message.community, m.message.community_length), "corridor");
  EXPECT_EQ(m.message.community, reinterpret_cast<const char*>(reply.data() + 7));
  EXPECT_EQ(m.message.pdu_type, kPduResponse);
  EXPECT_EQ(m.message.request_id, 7U);
  EXPECT_EQ(m.message.varbind_count, 1U);
  EXPECT_EQ(m.varbinds[0].type, kTagInteger);
  EXPECT_EQ(m.varbinds[0].int_value, 2);
  EXPECT_THAT(std::span(m.names[0].arcs, m.names[0].count),
              testing::ElementsAre(1, 3, 6, 1, 4, 1, 4242, 2, 4, 4, 1240, 1, 2, 0));
  EXPECT_EQ(m.octets[0].bytes, nullptr) << "an integer clears the string beside it";
  EXPECT_EQ(m.octets[0].length + m.octets[0].capacity, 0);
}

TEST(Decoding, KeepsTheCountOfAShorterNameAsItsRoom) {
  Message m(1);
  const auto shorter = hex(
      "30 1F 02 01 00 04 02 63 6f a2 16 02 01 07 02 01 02 02 01 01 30 0B 30 09 06 05 2b 06 01 04 "
      "01 05 00");
  ASSERT_EQ(m.decode(shorter), SNMP_OK);
  EXPECT_EQ(m.names[0].count, 6);
  EXPECT_EQ(m.message.error_status, 2U);
  EXPECT_EQ(m.message.error_index, 1U);
  EXPECT_EQ(m.varbinds[0].type, kTagNull);
  EXPECT_EQ(snmp_decode_message(m.message, realReply()), SNMP_ERR_CODEC) << "14 arcs into 6";
}

// A reply with these bindings, in hexadecimal.
std::vector<std::uint8_t> replyWith(const std::string& bindings) {
  const auto list = hex(bindings);
  auto reply = hex("30 00 02 01 00 04 00 a2 00 02 01 07 02 01 00 02 01 00 30 00");
  reply[1] = static_cast<std::uint8_t>(reply.size() - 2 + list.size());
  reply[8] = static_cast<std::uint8_t>(reply.size() - 9 + list.size());
  reply.back() = static_cast<std::uint8_t>(list.size());
  reply.insert(reply.end(), list.begin(), list.end());
  return reply;
}

TEST(Decoding, LaysStringsEndToEndInOneBuffer) {
  Message m(4);
  const auto reply = replyWith(
      "30 00 06 01 2B 04 03 61 62 63  30 00 06 01 2B 02 01 05  30 00 06 01 2B 40 04 0A 00 00 01"
      "30 00 06 01 2B 44 02 78 79");
  ASSERT_EQ(m.decode(reply), SNMP_OK);
  EXPECT_EQ(std::string(m.strings.begin(), m.strings.begin() + 9),
            std::string("abc\x0A\0\0\1xy", 9));
  EXPECT_EQ(m.octets[2].bytes, m.strings.data() + 3);
  EXPECT_EQ(m.octets[3].bytes, m.strings.data() + 7);
  EXPECT_EQ(m.octets[3].capacity, 1500 - 7);
  EXPECT_EQ(m.varbinds[3].index, 3U);
}

TEST(Decoding, KeepsStringsWithinTheBufferThatTheyShare) {
  const auto reply = replyWith("30 00 06 01 2B 04 03 61 62 63  30 00 06 01 2B 04 03 64 65 66");
  for (std::uint16_t room = 0; room < 8; ++room) {
    Message m(2, 14, room);
    EXPECT_EQ(m.decode(reply), room < 6 ? SNMP_ERR_CODEC : SNMP_OK) << room;
    EXPECT_TRUE(m.guardsIntact());
  }
}

TEST(Decoding, DoesNotSkipTheContentOfUnknownTypes) {
  Message m(2);
  EXPECT_EQ(m.decode(replyWith("30 00 06 01 2B 82 00  30 00 06 01 2B 05 00")), SNMP_OK);
  EXPECT_EQ(m.varbinds[0].type, 0x82U);
  EXPECT_EQ(m.decode(replyWith("30 00 06 01 2B 47 01 05  30 00 06 01 2B 05 00")), SNMP_ERR_CODEC);
  EXPECT_EQ(m.decode(replyWith("30 00 06 01 2B 47 07  30 00 06 01 2B 05 00")), SNMP_OK)
      << "content that is a binding itself";
  EXPECT_EQ(m.message.varbind_count, 2U);
}

TEST(Encoding, WritesTheRequestOfTheProgram) {
  Message m(1);
  ASSERT_EQ(m.decode(realReply()), SNMP_OK);
  snmp_message_init(m.message, 1);
  m.message.pdu_type = kPduSet;
  EXPECT_EQ(
      m.encode(),
      hex("30 2f 02 01 00 04 08 63 6f 72 72 69 64 6f 72 a3 20 02 01 07 02 01 00 02 01 00 30 15 "
          "30 13 06 0f 2b 06 01 04 01 a1 12 02 04 04 89 58 01 02 00 05 00"));
  EXPECT_EQ(m.varbinds[0].encoded_length, 19);
  snmp_message_init(m.message, 0);
  EXPECT_EQ(m.encode(),
            hex("30 1a 02 01 00 04 08 63 6f 72 72 69 64 6f 72 a3 0b 02 01 07 02 01 00 02 01 "
                "00 30 00"));
}

TEST(Encoding, RefusesWhatDoesNotFitAndLeavesTheBufferAlone) {
  Message m(1, 2, 65535);
  m.varbinds[0].type = kTagOctetString;
  m.octets[0].length = 100;
  const std::size_t size = m.encode().size();
  for (std::size_t room = 0; room <= size; ++room) {
    std::vector<std::uint8_t> bytes(room, 0xA5);
    std::uint16_t length = 0;
    const auto status = snmp_encode_message(m.message, bytes, length);
    EXPECT_EQ(status, room == size ? SNMP_OK : SNMP_ERR_CODEC);
    if (status == SNMP_OK) continue;
    EXPECT_EQ(std::count(bytes.begin(), bytes.end(), 0xA5), static_cast<long>(room));
  }
  m.octets[0].length = 65535;
  EXPECT_TRUE(m.encode().empty());
  m.octets[0].length = 0;
  m.message.varbind_count = 2;
  EXPECT_TRUE(m.encode().empty()) << "one binding more than the array has";
  m.message.varbind_count = 1;
  m.varbinds[0].octets_value = nullptr;
  EXPECT_TRUE(m.encode().empty());
}

TEST(Malformed, EveryTruncationIsRefused) {
  const auto reply = realReply();
  for (std::size_t length = 0; length < reply.size(); ++length) {
    Message m(1);
    const std::vector<std::uint8_t> cut(reply.begin(), reply.begin() + static_cast<long>(length));
    EXPECT_EQ(m.decode(cut), SNMP_ERR_CODEC) << length;
    EXPECT_TRUE(m.guardsIntact());
  }
}

TEST(Malformed, EverySingleByteChangeStaysWithinTheStorage) {
  Message m(1, 14, 2);
  for (std::size_t at = 0; at < realReply().size(); ++at) {
    for (int byte = 0; byte < 256; ++byte) {
      auto reply = realReply();
      reply[at] = static_cast<std::uint8_t>(byte);
      const snmp_status status = m.decode(reply);
      EXPECT_TRUE(status == SNMP_OK || status == SNMP_ERR_CODEC);
      EXPECT_LE(m.message.varbind_count, 1U);
      EXPECT_LE(m.names[0].count, 14);
      EXPECT_TRUE(m.guardsIntact());
    }
  }
}

TEST(Malformed, TheMistakesOfOtherCodecsAreNotMade) {
  const std::string body = "02 01 00 04 00 a2 0b 02 01 07 02 01 00 02 01 00 30 00";
  const struct {
    const char* what;
    std::string bytes;
    snmp_status status;
  } cases[] = {
      {"well formed, no bindings", "30 12 " + body, SNMP_OK},
      {"trailing bytes", "30 12 " + body + " 00 30 FF", SNMP_OK},
      {"zeros, as after a time-out", "00 00 00 00", SNMP_ERR_CODEC},
      {"length beyond the rest", "30 07 02 84 DE AD BA BE 00", SNMP_ERR_CODEC},
      {"length one beyond the rest", "30 13 " + body, SNMP_ERR_CODEC},
      {"length taken as signed", "30 82 FF FF " + body, SNMP_ERR_CODEC},
      {"indefinite length", "30 80 " + body + " 00 00", SNMP_ERR_CODEC},
      {"long form with a leading zero", "30 82 00 12 " + body, SNMP_OK},
      {"long form of a short length", "30 81 12 " + body, SNMP_OK},
      {"length of three bytes", "30 83 00 00 12 " + body, SNMP_ERR_CODEC},
      {"message shorter than its PDU", "30 10 " + body, SNMP_ERR_CODEC},
      {"PDU shorter than its fields", "30 12 02 01 00 04 00 a2 08 02 01 07 02 01 00 02 01 00 30 00",
       SNMP_ERR_CODEC},
      {"high tag number", "3F 12 " + body, SNMP_ERR_CODEC},
      {"high tag number of a PDU", "30 12 02 01 00 04 00 bf 0b 02 01 07 02 01 00 02 01 00 30 00",
       SNMP_ERR_CODEC},
      {"integer without content", "30 11 02 00 04 00 a2 0b 02 01 07 02 01 00 02 01 00 30 00",
       SNMP_ERR_CODEC},
      {"integer of four bytes",
       "30 15 02 04 00 00 00 00 04 00 a2 0b 02 01 07 02 01 00 02 01 00 30 00", SNMP_OK},
      {"integer of five bytes",
       "30 16 02 05 00 00 00 00 00 04 00 a2 0b 02 01 07 02 01 00 02 01 00 30 00", SNMP_ERR_CODEC},
      {"community beyond the message",
       "30 12 02 01 00 04 7F a2 0b 02 01 07 02 01 00 02 01 00 30 00", SNMP_ERR_CODEC},
  };
  for (const auto& c : cases) {
    Message m(1);
    EXPECT_EQ(m.decode(hex(c.bytes)), c.status) << c.what;
  }
}

TEST(Malformed, BindingsAreHeldToTheirRoomAndForm) {
  const struct {
    const char* what;
    const char* binding;
    snmp_status status;
  } cases[] = {
      {"name of as many arcs as there is room for", "30 00 06 03 2B 06 01 05 00", SNMP_OK},
      {"name of one arc more", "30 00 06 04 2B 06 01 04 05 00", SNMP_ERR_CODEC},
      {"binding longer than the list", "30 09 06 03 2B 06 01 05 00", SNMP_ERR_CODEC},
      {"largest arc", "30 00 06 04 2B 83 FF 7F 05 00", SNMP_OK},
      {"arc above 16 bits", "30 00 06 04 2B 84 80 00 05 00", SNMP_ERR_CODEC},
      {"arc that wraps 32 bits", "30 00 06 07 2B 90 80 80 80 80 01 05 00", SNMP_ERR_CODEC},
      {"arc without an end", "30 00 06 03 2B 06 81 05 00", SNMP_ERR_CODEC},
      {"name beyond the list", "30 00 06 7F 2B 06 01 05 00", SNMP_ERR_CODEC},
      {"unsigned of five bytes", "30 00 06 01 2B 42 05 00 FF FF FF FF", SNMP_ERR_CODEC},
      {"integer value without content", "30 00 06 01 2B 02 00", SNMP_ERR_CODEC},
      {"value beyond the list", "30 00 06 01 2B 05 01", SNMP_ERR_CODEC},
      {"string beyond the list", "30 00 06 01 2B 04 02 61", SNMP_ERR_CODEC},
      {"value of a high tag number", "30 00 06 01 2B 1F 00", SNMP_ERR_CODEC},
      {"no value", "30 00 06 01 2B", SNMP_ERR_CODEC},
      {"one binding more than the array has", "30 00 06 01 2B 05 00 30 00 06 01 2B 05 00",
       SNMP_ERR_CODEC},
  };
  for (const auto& c : cases) {
    Message m(1, 4);
    EXPECT_EQ(m.decode(replyWith(c.binding)), c.status) << c.what;
    EXPECT_TRUE(m.guardsIntact()) << c.what;
  }
}

TEST(Malformed, ManyBindingsAreCountedBeyondAByte) {
  for (const std::size_t bindings : {255U, 256U, 257U}) {
    Message sent(bindings, 2);
    const auto bytes = sent.encode();
    Message read(257, 2);
    EXPECT_EQ(read.decode(bytes), SNMP_OK);
    EXPECT_EQ(read.message.varbind_count, bindings);
    Message narrow(bindings - 1, 2);
    EXPECT_EQ(narrow.decode(bytes), SNMP_ERR_CODEC);
    EXPECT_TRUE(narrow.guardsIntact());
  }
}

}  // namespace

}  // namespace onramp

// Gets and sets of an agent that a test scripts: see tests/recording/agents.h.

#include "snmp/get_set.h"

#include <gtest/gtest.h>

#include "snmp/transport.h"
#include "tests/recording/agents.h"
#include "tests/snmp/message.h"

namespace onramp {

namespace {

using recording::Agents;

constexpr std::size_t kPduTagAt = 15;  // in a short message, behind the community
const std::int64_t kFirstExtendedIdentifier = snmp_request_counter_ext;

// Two slots for strings, each with "##" behind its room, and one for a number.
class GetSet : public testing::Test {
 protected:
  void SetUp() override {
    agents.reset();
    // Returns the request unless the test sets another reply.
    agents.reply = [this](const Agents::Bytes& request) {
      sent = request;
      return reply.empty() ? request : reply;
    };
    give(0, 9, 8);
    give(1, 9, 8);
  }

  void give(std::size_t slot, std::uint16_t capacity, std::uint16_t length) {
    texts[slot] = std::string(capacity, slot == 0 ? 'x' : 'y') + "##";
    octets[slot] = {length, capacity, reinterpret_cast<std::uint8_t*>(texts[slot].data())};
  }

  snmp_status get(std::size_t count, std::uint64_t kind = kPduGet) {
    m.reset();
    snmp_message_init(m.message, count);
    m.message.pdu_type = kind;
    return snmp_get(m.message, std::span(slots).first(count), "192.0.2.1", kModeNetwork);
  }
  // Binding i takes the slot that `indexes` has at i.
  snmp_status set(const std::vector<std::uint32_t>& indexes) {
    snmp_message_init(m.message, indexes.size());
    for (std::size_t i = 0; i < indexes.size(); ++i)
      m.varbinds[i].index = indexes[i];
    return snmp_set(m.message, slots, "192.0.2.1", kModeNetwork);
  }

  Agents& agents = Agents::instance();
  Agents::Bytes sent;
  Agents::Bytes reply;
  Message m{3};
  std::string texts[2];
  snmp_octets octets[2];
  snmp_result_slot slots[3] = {{.type = kTagOctetString, .octets = &octets[0]},
                               {.type = kTagOctetString, .octets = &octets[1]},
                               {.type = kTagInteger}};
};

TEST_F(GetSet, CopyValuesToTheirSlotsAndNotBeyond) {
  const std::string abc = "30 00 06 01 2B 04 03 61 62 63 ", five = "30 00 06 01 2B 02 01 05 ";
  const struct {
    const char* what;
    std::string reply;
    std::uint16_t capacity;  // of the second slot
    std::string second;      // what is in it afterwards; the reply is refused when it is unchanged
  } cases[] = {
      {"room for the zero", abc + abc + five, 4, std::string("abc\0##", 6)},
      {"no room for the zero", abc + abc + five, 3, "abc##"},
      {"no room for the string", abc + abc + five, 2, "yy##"},
      {"a number for a string", abc + five + five, 4, "yyyy##"},
      {"another kind of string", abc + "30 00 06 01 2B 44 01 61", 4, "yyyy##"},
      {"a value more than asked for", abc + abc + five + five, 4, "yyyy##"},
  };
  for (const auto& c : cases) {
    for (const bool setting : {false, true}) {
      SCOPED_TRACE(c.what + std::string(setting ? ", set" : ", get"));
      give(1, c.capacity, 1);
      slots[2].int_value = 9;
      reply = replyWith(c.reply);
      const bool taken = c.second[0] == 'a';
      EXPECT_EQ(setting ? set({0, 1, 2}) : get(3), taken ? SNMP_OK : SNMP_ERR_CODEC);
      EXPECT_EQ(texts[1], c.second);
      EXPECT_EQ(octets[1].length, taken ? 3 : 1);
      EXPECT_EQ(slots[2].int_value, taken ? 5 : 9);
      EXPECT_EQ(m.varbinds[1].octets_value, nullptr);
    }
  }
}

TEST_F(GetSet, SendTheSlotsThatTheIndexesNameWithinTheStorage) {
  for (const std::uint16_t length : std::vector<std::uint16_t>{1, 16, 17, 500, 700}) {
    give(0, 700, length);
    give(1, 700, length);
    ASSERT_EQ(set({1, 0}), SNMP_OK) << length;
    Message request(2);
    ASSERT_EQ(request.decode(sent), SNMP_OK);
    EXPECT_EQ(request.message.pdu_type, kPduSet);
    EXPECT_EQ(std::string(request.strings.begin(), request.strings.begin() + 2 * length),
              std::string(length, 'y') + std::string(length, 'x'));
    EXPECT_EQ(texts[0].front(), 'y') << "the reply's first value, for the first slot";
  }
  agents.asked.clear();
  give(0, 1500, 1485);
  EXPECT_EQ(set({0, 1}), SNMP_ERR_CODEC);
  EXPECT_EQ(set({3}), SNMP_ERR_CODEC);
  give(0, 60000, 60000);
  EXPECT_EQ(set({0}), SNMP_ERR_CODEC);
  EXPECT_TRUE(agents.asked.empty());

  slots[0] = {.type = kTagIpAddress};
  m.reset();
  m.octets[0].length = 4;
  m.varbinds[2].int_value = 70000;
  EXPECT_EQ(set({0, 1, 2}), SNMP_OK) << "an address and a number come from the bindings";
  EXPECT_EQ(slots[2].int_value, 70000);
}

TEST_F(GetSet, HandOnTheErrorStatusAndCountFromTwoHundred) {
  EXPECT_EQ(kFirstExtendedIdentifier, 200);
  const std::int64_t next = snmp_request_counter_ext;
  reply = replyWith("", 2);
  EXPECT_EQ(get(3, kPduResponse), 2U);
  EXPECT_EQ(sent.at(kPduTagAt), 0xA0);
  EXPECT_EQ(get(3, kPduGetNext), 2U);
  EXPECT_EQ(sent.at(kPduTagAt), 0xA1);
  EXPECT_EQ(set({0}), 2U);
  EXPECT_EQ(snmp_request_counter_ext, next + 3);

  reply = replyWith("30 00 06 01 2B 05 00");
  slots[0].type = kTagNull;
  slots[0].int_value = m.varbinds[0].int_value = 9;
  EXPECT_EQ(get(1), SNMP_OK);
  EXPECT_EQ(slots[0].int_value, 0) << "no earlier value";
}

}  // namespace

}  // namespace onramp

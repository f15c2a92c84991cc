// Sends table queries, get requests and set requests to the simulated agents of
// tests/recording/agents.h.

#include "snmp/query.h"

#include <gmock/gmock.h>

#include <algorithm>

#include "snmp/get_set.h"
#include "snmp/protocol.h"
#include "tests/recording/agents.h"
#include "tests/snmp/message.h"

namespace onramp {

namespace {

using recording::Agents;
using testing::ElementsAre;
using testing::IsEmpty;

constexpr const char* kNoReply = "nothing no reply -1 -1";
const std::int32_t kFirstIdentifier = snmp_request_counter;

class Query : public testing::Test {
 protected:
  void SetUp() override {
    agents.reset();
    snmp_request_counter = 7;  // replyWith() makes replies to request 7
  }
  void TearDown() override {
    snmp_oid& name = active_interface_table.entries[0].oid;
    std::copy(kActiveIFObject.begin(), kActiveIFObject.end(), name.arcs);
    name.count = kActiveIFObject.size();
  }

  void reply(const Agents::Bytes& bytes) {
    agents.reply = [bytes](const Agents::Bytes&) { return bytes; };
  }

  Agents& agents = Agents::instance();
};

// Queries `address` and returns the results as text: the keys and numbers, or "nothing"; "no reply"
// if `out_no_reply` is set; the error status; and the error index.
std::string outcome(mib_table* table, const char* address = "192.0.2.1") {
  bool noReply = false;
  std::int32_t status = -1;
  std::int32_t index = -1;
  const auto result = snmp_query_table(table, address, noReply, &status, &index);
  std::string text;
  for (const char* key : {"one", "two", "ActiveIF"}) {
    if (result && result->find(key))
      text += key + std::string(" ") + std::to_string(result->integerValue(key)) + " ";
  }
  return text + (result ? "" : "nothing ") + (noReply ? "no reply " : "") + std::to_string(status) +
         " " + std::to_string(index);
}

// Returns the hexadecimal text of a binding with the name 1.3 and the encoded value `value`.
std::string binding(const std::string& value) {
  return "30 00 06 01 2B " + value;
}

TEST_F(Query, BuildsTheResultFromTheValuesThatATableAsksFor) {
  const auto one = binding("02 01 05");
  const auto two = binding("02 04 80 00 00 00");
  const auto text = binding("04 01 05");
  auto stale = replyWith(one + two);
  stale[11] = 6;
  const std::tuple<const char*, Agents::Bytes, const char*> cases[] = {
      {"two integers", replyWith(one + two), "one 5 two -2147483648 0 0"},
      {"an unusable value before a usable one", replyWith(text + two), "two -2147483648 0 0"},
      {"an unusable value at the end", replyWith(one + text), "nothing 0 0"},
      {"a counter instead of an integer", replyWith(one + binding("41 01 02")), "nothing 0 0"},
      {"a missing value", replyWith(one), "nothing 0 0"},
      {"no values", replyWith(""), "nothing 0 0"},
      {"an error status", replyWith(one + two, 2, 3), "nothing 2 3"},
      {"one value too many", replyWith(one + two + one), kNoReply},
      {"the identifier of another request", stale, kNoReply},
      {"malformed", hex("30 07 02 84 DE AD BA BE 00"), kNoReply},
      {"empty", {}, kNoReply},
  };
  std::uint16_t arcs[] = {1, 3, 1, 1, 3, 2};
  mib_entry entries[2];
  mib_value_handler handlers[] = {{"one", decode_active_if}, {"two", decode_active_if}};
  mib_table table{entries, 2, handlers};
  const auto ask = [&](const Agents::Bytes& bytes) {
    for (std::size_t i = 0; i < 2; ++i)
      entries[i].oid = {3, 3, arcs + 3 * i};
    snmp_request_counter = 7;
    reply(bytes);
    return outcome(&table);
  };
  for (const auto& [what, reply, outcome] : cases)
    EXPECT_EQ(ask(reply), outcome) << what;
  handlers[0].decode = nullptr;
  EXPECT_EQ(ask(replyWith(text + two)), "two -2147483648 0 0");
  table.count = 0;
  EXPECT_EQ(ask(replyWith("")), "nothing 0 0");
}

TEST_F(Query, SendsTheNextIdentifierAndLimitsEachWaitToTwoSeconds) {
  EXPECT_EQ(kFirstIdentifier, 0);
  agents.answers["127.0.1.2"] = {2};
  bool noReply = false;
  EXPECT_EQ(
      snmp_query_table(&active_interface_table, "127.000.001.002", noReply, nullptr, nullptr),
      (Dictionary{{"ActiveIF", 2}, {"Connection", "Network"}, {"IPaddress", "127.000.001.002"}}));
  EXPECT_EQ(snmp_request_counter, 8);
  EXPECT_EQ(agents.port, 161);
  EXPECT_EQ(agents.room, 1500U);
  EXPECT_THAT(agents.asked, ElementsAre("127.0.1.2"));
  EXPECT_THAT(agents.waits, ElementsAre(std::chrono::seconds(2), std::chrono::seconds(2)));
}

TEST_F(Query, ReportsAFailedRequestAsNoReplyButNotANullArgument) {
  EXPECT_EQ(outcome(&active_interface_table), kNoReply);
  agents.answers["192.0.2.1"] = {Agents::kRefused};
  EXPECT_EQ(outcome(&active_interface_table), kNoReply);
  EXPECT_EQ(outcome(&active_interface_table, ""), kNoReply);
  EXPECT_EQ(outcome(&active_interface_table, nullptr), "nothing -1 -1");
  EXPECT_EQ(outcome(nullptr), "nothing -1 -1");
  EXPECT_EQ(agents.asked.size(), 2U);
  agents.socketsOpen = false;
  EXPECT_EQ(outcome(&active_interface_table), kNoReply);
}

TEST_F(Query, KeepsTheShorterNameOfAReplyAndThenRefusesALongerOne) {
  reply(replyWith("30 00 06 05 2B 06 01 04 01 02 01 02"));
  EXPECT_EQ(outcome(&active_interface_table), "ActiveIF 2 0 0");
  EXPECT_EQ(active_interface_table.entries[0].oid.count, 6);
  snmp_request_counter = 7;
  reply(realReply());
  EXPECT_EQ(outcome(&active_interface_table), kNoReply) << "the name has 14 arcs, but only 6 fit";
}

TEST_F(Query, ReturnsTheStatusOfTheExchange) {
  Message m(1);
  EXPECT_EQ(snmp_exchange(m.message, "192.0.2.1", kModeNoNetwork), SNMP_ERR_CODEC);
  EXPECT_THAT(agents.asked, IsEmpty());

  reply(replyWith(binding("05 00")));
  EXPECT_EQ(snmp_exchange(m.message, "somewhere", 0), SNMP_OK)
      << "every mode but kModeNoNetwork sends";
  EXPECT_THAT(agents.asked, ElementsAre("255.255.255.255"));
  EXPECT_EQ(std::string(m.message.community, m.message.community_length), "corridor")
      << "the reply does not change the community";

  snmp_request_counter = 6;
  EXPECT_EQ(snmp_request_to_address(&m.message, "192.0.2.1"), SNMP_ERR_TRANSPORT)
      << "the reply answers another request";
  agents.socketsOpen = false;
  EXPECT_EQ(snmp_exchange(m.message, "192.0.2.1", kModeNetwork), SNMP_ERR_TRANSPORT);
  EXPECT_EQ(snmp_request_to_address(nullptr, "192.0.2.1"), SNMP_ERR_TRANSPORT);
  m.varbinds[0].name = nullptr;
  snmp_request_counter = INT32_MAX;
  EXPECT_EQ(snmp_request_to_address(&m.message, "192.0.2.1"), SNMP_ERR_CODEC)
      << "a binding has no name";
  EXPECT_EQ(snmp_request_counter, INT32_MIN);
}

TEST(Addresses, AreNormalizedPartByPart) {
  const std::pair<const char*, std::optional<std::string>> cases[] = {
      {"192.168.001.010", "192.168.1.10"},
      {"printer.local", "0.0"},
      {"1..2", "1.0.2"},
      {" 7x.-3", "7.-3"},
      {"1.2.3.4.5.6.7.8.9.1.2.3.4.5.6.7", "1.2.3.4.5.6.7.8.9.1.2.3.4.5.6.7"},
      {"1.2.3.4.5.6.7.8.9.1.2.3.4.5.6.17", std::nullopt},
      {"", std::nullopt},
      {nullptr, std::nullopt},
  };
  for (const auto& [text, normalized] : cases)
    EXPECT_EQ(snmp_normalize_ipv4(text), normalized) << (text ? text : "null");
}

constexpr std::size_t kPduTagAt = 15;  // the offset of the PDU's tag in a short message
const std::int64_t kFirstExtendedIdentifier = snmp_request_counter_ext;

// Sends get and set requests with two string slots and a number slot. "##" follows each string's
// storage, so that a test sees a write past the end.
class GetSet : public testing::Test {
 protected:
  void SetUp() override {
    agents.reset();
    // If the test does not set `reply`, the agent sends the request back.
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
  // Binding i uses slots[indexes[i]].
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

TEST_F(GetSet, CopyValuesIntoTheirSlotsAndNeverPastThem) {
  const std::string abc = "30 00 06 01 2B 04 03 61 62 63 ", five = "30 00 06 01 2B 02 01 05 ";
  // Each row has a name, the reply's bindings, the capacity of the second slot, and the contents of
  // that slot after the reply. A refused reply does not change the slot.
  const std::tuple<const char*, std::string, std::uint16_t, std::string> cases[] = {
      {"room for the zero", abc + abc + five, 4, std::string("abc\0##", 6)},
      {"no room for the zero", abc + abc + five, 3, "abc##"},
      {"no room for the string", abc + abc + five, 2, "yy##"},
      {"a number instead of a string", abc + five + five, 4, "yyyy##"},
      {"another kind of string", abc + "30 00 06 01 2B 44 01 61", 4, "yyyy##"},
      {"one value too many", abc + abc + five + five, 4, "yyyy##"},
  };
  for (const auto& [what, bindings, capacity, second] : cases) {
    for (const bool setting : {false, true}) {
      SCOPED_TRACE(what + std::string(setting ? ", set" : ", get"));
      give(1, capacity, 1);
      slots[2].int_value = 9;
      reply = replyWith(bindings);
      const bool taken = second[0] == 'a';
      EXPECT_EQ(setting ? set({0, 1, 2}) : get(3), taken ? SNMP_OK : SNMP_ERR_CODEC);
      EXPECT_EQ(texts[1], second);
      EXPECT_EQ(octets[1].length, taken ? 3 : 1);
      EXPECT_EQ(slots[2].int_value, taken ? 5 : 9);
      EXPECT_EQ(m.varbinds[1].octets_value, nullptr);
    }
  }
}

TEST_F(GetSet, SetSendsTheSlotOfEachBindingUnlessTheStringsAreTooLong) {
  for (const std::uint16_t length : std::vector<std::uint16_t>{1, 17, 700}) {
    give(0, 700, length);
    give(1, 700, length);
    ASSERT_EQ(set({1, 0}), SNMP_OK) << length;
    Message request(2);
    ASSERT_EQ(request.decode(sent), SNMP_OK);
    const auto both = request.strings.begin();
    EXPECT_EQ(std::string(both, both + std::ptrdiff_t{2} * length),
              std::string(length, 'y') + std::string(length, 'x'));
    EXPECT_EQ(texts[0].front(), 'y') << "the reply's first value goes to the first slot";
  }
  agents.asked.clear();
  give(0, 60000, 1485);
  EXPECT_EQ(set({0, 1}), SNMP_ERR_CODEC);
  EXPECT_EQ(set({3}), SNMP_ERR_CODEC);
  octets[0].length = 60000;
  EXPECT_EQ(set({0}), SNMP_ERR_CODEC);
  EXPECT_TRUE(agents.asked.empty());

  slots[0] = {.type = kTagIpAddress};
  m.reset();
  m.octets[0].length = 4;
  m.varbinds[2].int_value = 70000;
  EXPECT_EQ(set({0, 1, 2}), SNMP_OK) << "the address and the number come from the bindings";
  EXPECT_EQ(slots[2].int_value, 70000);
}

TEST_F(GetSet, ReturnTheErrorStatusAndNumberRequestsFrom200) {
  EXPECT_EQ(kFirstExtendedIdentifier, 200);
  const std::int64_t next = snmp_request_counter_ext;
  reply = replyWith("", 2);
  for (const auto& [kind, tag] : {std::pair(kPduResponse, 0xA0), std::pair(kPduGetNext, 0xA1)}) {
    EXPECT_EQ(get(3, kind), 2U);
    EXPECT_EQ(sent.at(kPduTagAt), tag);
  }
  EXPECT_EQ(set({0}), 2U);
  EXPECT_EQ(sent.at(kPduTagAt), 0xA3);
  EXPECT_EQ(snmp_request_counter_ext, next + 3);

  reply = replyWith("30 00 06 01 2B 05 00");
  slots[0] = {.type = kTagNull, .int_value = 9};
  EXPECT_EQ(get(1), SNMP_OK);
  EXPECT_EQ(slots[0].int_value, 0) << "a NULL value clears the number";
}

}  // namespace

}  // namespace onramp

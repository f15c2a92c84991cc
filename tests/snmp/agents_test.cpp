// Exchanges with the agents of agents.py, which runs this program.

#include <gtest/gtest.h>

#include <chrono>
#include <filesystem>

#include "snmp/get_set.h"
#include "snmp/query.h"
#include "tests/snmp/message.h"

namespace onramp {

namespace {

using std::chrono::milliseconds;
using std::chrono::steady_clock;

struct Answer {
  std::optional<Dictionary> result;
  bool noReply = false;
  std::int32_t errorStatus = -1;
  std::int32_t errorIndex = -1;

  [[nodiscard]] std::int64_t activeIF() const {
    return result ? result->integerValue(kActiveIFKey) : -1;
  }
};

Answer ask(const std::string& address) {
  Answer answer;
  answer.result = snmp_query_table(&active_interface_table, address.c_str(), answer.noReply,
                                   &answer.errorStatus, &answer.errorIndex);
  return answer;
}

template <typename Work>
milliseconds timeOf(Work work) {
  const auto start = steady_clock::now();
  work();
  return std::chrono::duration_cast<milliseconds>(steady_clock::now() - start);
}

long openDescriptors() {
  using std::filesystem::directory_iterator;
  return std::distance(directory_iterator("/proc/self/fd"), directory_iterator());
}

TEST(Query, ReadsTheActiveInterfaceFromNetSnmp) {
  const Answer wireless = ask("127.0.1.1");
  EXPECT_EQ(wireless.result,
            (Dictionary{{"ActiveIF", 2}, {"Connection", "Network"}, {"IPaddress", "127.0.1.1"}}));
  EXPECT_EQ(wireless.errorStatus, 0);
  EXPECT_EQ(wireless.errorIndex, 0);
  EXPECT_FALSE(wireless.noReply);
  EXPECT_EQ(ask("127.0.1.2").activeIF(), 1);
  EXPECT_EQ(ask("127.000.001.002").result->string("IPaddress"), "127.000.001.002");
}

TEST(Query, TellsRefusalsAndWrongTypesFromSilence) {
  const struct {
    const char* what;
    const char* address;
    bool noReply;
    std::int32_t errorStatus;
  } cases[] = {
      {"object missing", "127.0.1.3", false, 2},
      {"string for an integer", "127.0.1.4", false, 0},
      {"no binding at all", "127.0.2.5", false, 0},
      {"another request's identifier", "127.0.2.1", true, -1},
      {"malformed", "127.0.2.4", true, -1},
      {"one binding more than asked for", "127.0.2.6", true, -1},
      {"empty datagram", "127.0.2.8", true, -1},
  };
  for (const auto& c : cases) {
    const Answer answer = ask(c.address);
    EXPECT_FALSE(answer.result) << c.what;
    EXPECT_EQ(answer.noReply, c.noReply) << c.what;
    EXPECT_EQ(answer.errorStatus, c.errorStatus) << c.what;
  }
}

TEST(Query, TakesOnlyWhatTheDeviceAskedSends) {
  EXPECT_EQ(ask("127.0.2.3").activeIF(), 2)
      << "strangers answer first, and otherwise; it does twice";
  EXPECT_EQ(ask("127.0.2.9").activeIF(), 2) << "with more than is ever read behind it";
  EXPECT_EQ(ask("127.0.1.2").activeIF(), 1) << "after these";
  Answer answer;
  EXPECT_GE(timeOf([&] { answer = ask("127.0.2.2"); }), milliseconds(2000));
  EXPECT_TRUE(answer.noReply) << "from another port only";
}

TEST(Query, WaitsTwoSecondsForAnAnswer) {
  EXPECT_EQ(ask("127.0.1.7").activeIF(), 2) << "after 1 s";
  EXPECT_TRUE(ask("127.0.1.8").noReply) << "after 2.5 s";
  EXPECT_EQ(ask("127.0.1.2").activeIF(), 1) << "the late answer does no harm";
}

TEST(Query, KeepsAShorterNameForLaterRequests) {
  const snmp_oid name = active_interface_table.entries[0].oid;
  const std::vector<std::uint16_t> arcs(name.arcs, name.arcs + name.count);
  EXPECT_EQ(ask("127.0.2.7").activeIF(), 2);
  EXPECT_EQ(active_interface_table.entries[0].oid.count, 6);
  EXPECT_EQ(ask("127.0.1.1").errorStatus, 2) << "asked for 1.3.6.1.4.1";
  active_interface_table.entries[0].oid = name;
  std::copy(arcs.begin(), arcs.end(), name.arcs);
  EXPECT_EQ(ask("127.0.1.1").activeIF(), 2);
}

TEST(Query, SetsTheFlagForATextThatIsNoAddress) {
  EXPECT_TRUE(ask("").noReply);
  Answer answer;
  EXPECT_FALSE(
      snmp_query_table(&active_interface_table, nullptr, answer.noReply, nullptr, nullptr));
  EXPECT_FALSE(snmp_query_table(nullptr, "127.0.1.1", answer.noReply, nullptr, nullptr));
  EXPECT_FALSE(answer.noReply);
}

// Which answer counts, the chooser's tests say.
TEST(Wireless, IsWhatADeviceSays) {
  EXPECT_TRUE(snmp_active_interface_is_wireless({"127.0.1.1", "127.0.1.2"}));
  EXPECT_FALSE(snmp_active_interface_is_wireless({"127.0.1.3", "127.0.1.1"})) << "refused";
  EXPECT_FALSE(snmp_active_interface_is_wireless({5, "127.0.1.1"})) << "no text";
}

TEST(Wireless, ASilentAddressCostsThreeAttemptsOfTwoRequests) {
  bool wireless = true;
  const auto took = timeOf([&] { wireless = snmp_active_interface_is_wireless({"127.0.1.6"}); });
  EXPECT_FALSE(wireless);
  EXPECT_GE(took, milliseconds(6 * 2000 + 3 * 20));
  EXPECT_LT(took, milliseconds(6 * 4000));
}

constexpr std::uint16_t kSystemRoom = 9;
const std::vector<std::uint16_t> kSysContact = {1, 3, 6, 1, 2, 1, 1, 4, 0};
const std::vector<std::uint16_t> kSysName = {1, 3, 6, 1, 2, 1, 1, 5, 0};

TEST(GetAndSet, WriteStringsAndReadThemBack) {
  const std::string contact = "A contact of more than sixteen bytes";
  std::string texts[] = {contact, "Printer"};
  snmp_octets strings[2];
  for (std::size_t i = 0; i < 2; ++i) {
    const auto length = static_cast<std::uint16_t>(texts[i].size());
    strings[i] = {length, length, reinterpret_cast<std::uint8_t*>(texts[i].data())};
  }
  snmp_result_slot slots[] = {{.type = kTagOctetString, .octets = &strings[0]},
                              {.type = kTagOctetString, .octets = &strings[1]}};
  Message m(2, kSystemRoom);
  Message::set(m.names[0], kSysContact);
  Message::set(m.names[1], kSysName);
  m.varbinds[0].index = 0;
  m.varbinds[1].index = 1;
  ASSERT_EQ(snmp_set(m.message, slots, "127.0.1.5", kModeNetwork), SNMP_OK);
  EXPECT_EQ(m.varbinds[0].octets_value, nullptr);

  std::uint8_t read[2][64] = {};
  strings[0] = {0, 64, read[0]};
  strings[1] = {0, 7, read[1]};
  snmp_message_init(m.message, 2);
  ASSERT_EQ(snmp_get(m.message, slots, "127.0.1.5", kModeNetwork), SNMP_OK);
  EXPECT_EQ(std::string(reinterpret_cast<char*>(read[0])), contact);
  EXPECT_EQ(strings[0].length, contact.size());
  EXPECT_EQ(std::string(reinterpret_cast<char*>(read[1]), strings[1].length), "Printer");

  strings[1].capacity = 6;
  snmp_message_init(m.message, 2);
  EXPECT_EQ(snmp_get(m.message, slots, "127.0.1.5", kModeNetwork), SNMP_ERR_CODEC) << "no room";
  snmp_message_init(m.message, 2);
  slots[0].type = kTagInteger;
  EXPECT_EQ(snmp_get(m.message, slots, "127.0.1.5", kModeNetwork), SNMP_ERR_CODEC) << "type";
}

TEST(GetAndSet, HandOnTheErrorStatusAndAskForTheNextObject) {
  Message m(1);
  Message::set(m.names[0],
               std::vector<std::uint16_t>{1, 3, 6, 1, 4, 1, 4242, 2, 4, 4, 1240, 1, 1, 9});
  snmp_result_slot slot{.type = kTagInteger};
  EXPECT_EQ(snmp_get(m.message, {&slot, 1}, "127.0.1.1", kModeNetwork), 2U) << "noSuchName";
  m.message.pdu_type = kPduGetNext;
  EXPECT_EQ(snmp_get(m.message, {&slot, 1}, "127.0.1.1", kModeNetwork), SNMP_OK);
  EXPECT_EQ(slot.int_value, 2);
}

TEST(Exchange, LeavesNoDescriptorOpen) {
  const long before = openDescriptors();
  for (int i = 0; i < 2000; ++i) {
    for (const char* const address : {"127.0.1.1", "127.0.2.1", "127.0.2.4", "127.0.2.8"})
      ask(address);
    Message m(1);
    EXPECT_EQ(snmp_exchange(m.message, "127.0.1.1", kModeNoNetwork), SNMP_ERR_CODEC);
  }
  EXPECT_EQ(openDescriptors(), before);
}

}  // namespace

}  // namespace onramp

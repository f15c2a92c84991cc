#include "snmp/query.h"

#include <chrono>
#include <cstring>
#include <thread>

#include "snmp/protocol.h"

namespace onramp {

namespace {

constexpr int kAttemptsPerAddress = 3;
constexpr int kCallsPerAttempt = 2;
constexpr std::chrono::milliseconds kPauseBetweenAttempts{20};

auto active_if_arcs = kActiveIFObject;

std::array<mib_entry, 1> active_if_entries = {
    {{kTagInteger, {active_if_arcs.size(), active_if_arcs.size(), active_if_arcs.data()}}}};

constexpr std::array<mib_value_handler, 1> kActiveIFHandlers = {{{kActiveIFKey, decode_active_if}}};

// Compares only the first halves of the two names: `capacity` is a number of arcs but is used here
// as a number of bytes, and an arc takes two bytes. The names in a reply always match, because a
// reply is decoded into the table's own names.
bool names_match(const snmp_oid& entry, const snmp_oid& name) {
  return name.capacity >= entry.capacity && std::memcmp(entry.arcs, name.arcs, entry.capacity) == 0;
}

void store(std::int32_t* out, std::uint64_t value) {
  if (out) *out = static_cast<std::int32_t>(value);
}

// Calls `ask` a second time if the first call returns nothing.
template <typename Ask>
std::optional<Dictionary> ask_twice(const Ask& ask) {
  std::optional<Dictionary> result;
  for (int call = 0; call < kCallsPerAttempt && !result; ++call)
    result = ask();
  return result;
}

}  // namespace

mib_table active_interface_table = {active_if_entries.data(), active_if_entries.size(),
                                    kActiveIFHandlers.data()};

snmp_status decode_active_if(Dictionary& dictionary, const char* name, const snmp_varbind& binding,
                             std::uint64_t /*reserved*/) {
  if (binding.type != kTagInteger) return 1;
  const auto number = static_cast<std::int32_t>(binding.int_value);
  dictionary = dictionary.with(name, std::int64_t{number});
  return 0;
}

snmp_table_request::snmp_table_request(mib_table& table)
    : table_(table), bindings_(table.count), octets_(table.count) {
  message_.varbinds = bindings_;
  message_.pdu_type = kPduGet;
  snmp_message_init(message_, table.count);
  for (std::size_t i = 0; i < bindings_.size(); ++i)
    bindings_[i].name = &table.entries[i].oid;
  clear_values();
}

void snmp_table_request::clear_values() {
  for (std::size_t i = 0; i < bindings_.size(); ++i) {
    octets_[i] = {kReplySize, kReplySize, strings_.data()};
    bindings_[i].type = kTagNull;
    bindings_[i].octets_value = &octets_[i];
  }
}

std::optional<Dictionary> snmp_table_request::result(const std::string& address) const {
  std::optional<Dictionary> result;
  for (std::size_t i = 0; i < bindings_.size(); ++i) {
    if (!names_match(table_.entries[i].oid, *bindings_[i].name)) return std::nullopt;
    if (!result) result.emplace();
    const mib_value_handler& handler = table_.handlers[i];
    if (handler.decode && handler.decode(*result, handler.name, bindings_[i], 0)) result.reset();
  }
  if (!result) return std::nullopt;
  return result->with(kConnectionKey, "Network").with(kIPAddressKey, address);
}

std::optional<Dictionary> snmp_query_table(mib_table* table, const char* address,
                                           bool& out_no_reply, std::int32_t* out_error_status,
                                           std::int32_t* out_error_index) {
  if (!table || !address) return std::nullopt;
  snmp_table_request request(*table);
  if (snmp_request_to_address(&request.message(), address)) {
    out_no_reply = true;
    return std::nullopt;
  }
  store(out_error_status, request.message().error_status);
  store(out_error_index, request.message().error_index);
  if (request.message().error_status != 0) return std::nullopt;
  return request.result(address);
}

std::optional<Dictionary> snmp_query_table_retry(mib_table* table, const char* address,
                                                 bool& out_no_reply, std::int32_t* out_error_status,
                                                 std::int32_t* out_error_index) {
  return ask_twice([&] {
    return snmp_query_table(table, address, out_no_reply, out_error_status, out_error_index);
  });
}

bool snmp_active_interface_is_wireless(const Array& addresses) {
  return snmp_active_interface_is_wireless(addresses, [](const char* address, bool& no_reply) {
    return snmp_query_table(&active_interface_table, address, no_reply, nullptr, nullptr);
  });
}

bool snmp_active_interface_is_wireless(const Array& addresses, const snmp_ask& ask) {
  std::int64_t active_interface = 0;
  for (const Value& address : addresses) {
    bool no_reply = false;  // never reset: after one unanswered request, all attempts are made
    for (int attempt = 0; attempt < kAttemptsPerAddress; ++attempt) {
      const auto* const text = address.as<std::string>();
      const auto result = ask_twice([&] { return ask(text ? text->c_str() : nullptr, no_reply); });
      active_interface = result ? result->integerValue(kActiveIFKey) : 0;
      if (!no_reply) return active_interface == kActiveIFWireless;
      std::this_thread::sleep_for(kPauseBetweenAttempts);
    }
  }
  return active_interface == kActiveIFWireless;
}

}  // namespace onramp

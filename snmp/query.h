#pragma once

#include <array>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "base/value.h"
#include "snmp/records.h"
#include "snmp/status.h"
#include "snmp/transport.h"

namespace onramp {

/// One object to ask for. `expected_type` is not checked; the handler decides which types it
/// accepts in a reply.
struct mib_entry {
  std::uint64_t expected_type = kTagInteger;
  snmp_oid oid;  ///< the name asked for; the reply's name is decoded into the same storage
};

/// Stores the value of a reply's binding in `result` under `name` and returns 0. Returns any other
/// number to refuse the value. The last argument is always 0.
using mib_decode = snmp_status (*)(Dictionary& result, const char* name,
                                   const snmp_varbind& binding, std::uint64_t reserved);

/// Says how to store the value of one mib_entry. The entry and its handler have the same index in
/// their arrays.
struct mib_value_handler {
  const char* name = nullptr;   ///< the value's key in the result
  mib_decode decode = nullptr;  ///< null when the value is not stored
};

/// The objects that one request asks for: `count` entries, and a handler for each of them.
struct mib_table {
  mib_entry* entries = nullptr;
  std::uint64_t count = 0;
  const mib_value_handler* handlers = nullptr;
};

/// The two keys that every result of a query has. The other keys are the names of the table's
/// handlers.
constexpr const char* kConnectionKey = "Connection";  ///< string, always "Network"
constexpr const char* kIPAddressKey = "IPaddress";    ///< string, the device's address

constexpr const char* kActiveIFKey = "ActiveIF";  ///< number: the device's active interface

/// The table that asks for kActiveIFObject. The name in each reply overwrites the name in this
/// table, and later requests ask for the new name. After a reply with a shorter name, a reply whose
/// name is longer than that one is refused.
extern mib_table active_interface_table;

/// Stores an INTEGER under `name` as a 32-bit number and returns 0. Returns 1 for a value of any
/// other type.
[[nodiscard]] snmp_status decode_active_if(Dictionary& dictionary, const char* name,
                                           const snmp_varbind& binding, std::uint64_t reserved);

/// A get request for the objects of a table, with storage for the reply. The table must outlive the
/// request.
class snmp_table_request {
 public:
  explicit snmp_table_request(mib_table& table);
  snmp_table_request(const snmp_table_request&) = delete;
  snmp_table_request& operator=(const snmp_table_request&) = delete;
  ~snmp_table_request() = default;

  /// The message to send. The reply is decoded into the same message. The caller sets `request_id`.
  [[nodiscard]] snmp_message& message() { return message_; }

  /// Prepares the message for decoding another reply, and discards the values of the previous
  /// reply.
  void clear_values();

  /// Passes the reply's values to the handlers, and returns the values that follow the last refused
  /// one. Adds kConnectionKey, and `address` under kIPAddressKey. Returns nothing when the value of
  /// the last entry is refused, and when the table has no entries.
  [[nodiscard]] std::optional<Dictionary> result(const std::string& address) const;

 private:
  mib_table& table_;
  std::vector<snmp_varbind> bindings_;
  std::vector<snmp_octets> octets_;
  std::array<std::uint8_t, kReplySize> strings_{};  // the strings of all bindings, end to end
  snmp_message message_;
};

/// Asks the device at `address`, an IPv4 address in dotted form, for the objects of `table`.
/// Returns nothing when `table` or `address` is null, when the request fails, when the reply has an
/// error status, and when snmp_table_request::result() returns nothing for the reply. A request
/// fails when it cannot be sent or gets no valid reply. Sets `out_no_reply` to true when the
/// request fails, and otherwise leaves it unchanged. Stores the error status and index of a reply
/// in the last two arguments, each of which may be null. May block as long as snmp_exchange() does.
[[nodiscard]] std::optional<Dictionary> snmp_query_table(mib_table* table, const char* address,
                                                         bool& out_no_reply,
                                                         std::int32_t* out_error_status,
                                                         std::int32_t* out_error_index);

/// Calls snmp_query_table(), and calls it again if the first call returns nothing.
[[nodiscard]] std::optional<Dictionary> snmp_query_table_retry(mib_table* table,
                                                               const char* address,
                                                               bool& out_no_reply,
                                                               std::int32_t* out_error_status,
                                                               std::int32_t* out_error_index);

/// Returns whether a device reports that it is using its wireless interface. `addresses` holds the
/// device's addresses as strings, which are tried in order. A try makes one request, and a second
/// request if the first returns no result. An address whose first try gets a reply to each of its
/// requests decides the result, and later addresses are not tried. Any other address is tried three
/// times, with a pause of 20 ms after each try. If no address decides, the last try of the last
/// address does. A try without a result counts as an ActiveIF of 0, and so does an empty list of
/// addresses. An entry that is not a string counts as an address that replies without a result.
///
/// Blocks for about 12 seconds for each address that sends nothing back, not even a report that the
/// port is closed.
[[nodiscard]] bool snmp_active_interface_is_wireless(const Array& addresses);

/// Makes one request to the device at `address`, which is null if the entry in the list of
/// addresses is not a string. Returns what snmp_query_table() returns, and sets `no_reply` as
/// that function sets `out_no_reply`.
using snmp_ask = std::function<std::optional<Dictionary>(const char* address, bool& no_reply)>;

/// Does what snmp_active_interface_is_wireless() above does, but calls `ask` to make each request.
/// This lets a caller record the requests.
[[nodiscard]] bool snmp_active_interface_is_wireless(const Array& addresses, const snmp_ask& ask);

}  // namespace onramp

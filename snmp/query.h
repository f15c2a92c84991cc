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

/// One object to ask for.
struct mib_entry {
  std::uint64_t expected_type = kTagInteger;
  snmp_oid oid;  ///< the name asked for; the reply's name is decoded into the same storage
};

/// Stores the value of a reply's binding in `result` under `name`. Returns 0, or another number to
/// refuse the value. The last argument is always 0.
using mib_decode = snmp_status (*)(Dictionary& result, const char* name,
                                   const snmp_varbind& binding, std::uint64_t reserved);

/// Tells how to store the value of the mib_entry that has the same index in the table.
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

/// Keys of a result in addition to those of its table's handlers.
constexpr const char* kConnectionKey = "Connection";  ///< string, always "Network"
constexpr const char* kIPAddressKey = "IPaddress";    ///< string, the device's address

constexpr const char* kActiveIFKey = "ActiveIF";  ///< number: the device's active interface

/// The table that asks for kActiveIFObject. The name in each reply overwrites the name in this
/// table, and later requests ask for the new name. After a reply with a shorter name, only names of
/// at most that length fit.
extern mib_table active_interface_table;

/// Stores an INTEGER under `name` as a 32-bit number and returns 0. Returns 1 for a value of any
/// other type.
[[nodiscard]] snmp_status decode_active_if(Dictionary& dictionary, const char* name,
                                           const snmp_varbind& binding, std::uint64_t reserved);

/// A get request for the objects of a table, with the storage for its replies. The table must
/// outlive the request.
class snmp_table_request {
 public:
  explicit snmp_table_request(mib_table& table);
  snmp_table_request(const snmp_table_request&) = delete;
  snmp_table_request& operator=(const snmp_table_request&) = delete;
  ~snmp_table_request() = default;

  /// The message to send, and to decode the reply into. The caller sets its `request_id`.
  [[nodiscard]] snmp_message& message() { return message_; }

  /// Forgets the previous reply's values, so that another reply can be decoded into the message.
  void clear_values();

  /// Returns the values that the handlers store from the reply in the message, plus kConnectionKey
  /// and, under kIPAddressKey, `address`. If a handler refuses a value, all values stored before it
  /// are dropped. Returns nothing when the value of the last entry is refused, and when the table
  /// has no entries.
  [[nodiscard]] std::optional<Dictionary> result(const std::string& address) const;

 private:
  mib_table& table_;
  std::vector<snmp_varbind> bindings_;
  std::vector<snmp_octets> octets_;
  std::array<std::uint8_t, kReplySize> strings_{};  // those of all bindings, end to end
  snmp_message message_;
};

/// Asks the device at `address`, a dotted IPv4 text, for the objects of `table`. Returns nothing
/// when `table` or `address` is null, when the reply has an error status, when
/// snmp_table_request::result() returns nothing for the reply, and when no valid reply comes.
/// `out_no_reply` is set to true in the last case only and is never cleared. A reply's error status
/// and index are stored in the last two arguments, which may be null. Blocks as snmp_exchange does.
[[nodiscard]] std::optional<Dictionary> snmp_query_table(mib_table* table, const char* address,
                                                         bool& out_no_reply,
                                                         std::int32_t* out_error_status,
                                                         std::int32_t* out_error_index);

/// Does what snmp_query_table does, but asks a second time when the first request gives no result.
[[nodiscard]] std::optional<Dictionary> snmp_query_table_retry(mib_table* table,
                                                               const char* address,
                                                               bool& out_no_reply,
                                                               std::int32_t* out_error_status,
                                                               std::int32_t* out_error_index);

/// Returns whether the device with these addresses, which are strings, reports that it is using its
/// wireless interface. Tries the addresses in order. The first address that answers every request
/// decides the result. An address that leaves a request unanswered is tried three times, 20 ms
/// apart, with up to two requests per try. If no address decides, the last try of the last address
/// does. A try without a result counts as the value 0 of ActiveIF, and so does an empty array of
/// addresses.
///
/// Blocks for about 12 seconds for an address from which nothing comes back, not even a refusal.
[[nodiscard]] bool snmp_active_interface_is_wireless(const Array& addresses);

/// Makes one request to the device at `address`, which is null when the entry in the array of
/// addresses is not a string. Returns what snmp_query_table returns, and sets `no_reply` when that
/// function sets `out_no_reply`.
using snmp_ask = std::function<std::optional<Dictionary>(const char* address, bool& no_reply)>;

/// Does what the other function of this name does, but makes its requests through `ask`, so that a
/// caller can record them.
[[nodiscard]] bool snmp_active_interface_is_wireless(const Array& addresses, const snmp_ask& ask);

}  // namespace onramp

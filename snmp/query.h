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

/// Handler for the entry at the same index.
struct mib_value_handler {
  const char* name = nullptr;  ///< the result's key
  mib_decode decode = nullptr;
};

/// The objects that one request asks for.
struct mib_table {
  mib_entry* entries = nullptr;
  std::uint64_t count = 0;
  const mib_value_handler* handlers = nullptr;
};

/// Keys of a result in addition to those of its table's handlers.
constexpr const char* kConnectionKey = "Connection";  ///< string, always "Network"
constexpr const char* kIPAddressKey = "IPaddress";    ///< string, the device's address

constexpr const char* kActiveIFKey = "ActiveIF";  ///< number: the device's active interface

/// Asks for kActiveIFObject. The name in each reply replaces the one here and is what later
/// requests ask for. After a shorter one, only names of at most that length fit.
extern mib_table active_interface_table;

/// Stores an INTEGER as a 32-bit number. Returns 1 for a value of any other type.
[[nodiscard]] snmp_status decode_active_if(Dictionary& dictionary, const char* name,
                                           const snmp_varbind& binding, std::uint64_t reserved);

/// A get request for the objects of a table, with the storage for its replies.
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

  /// Returns what the handlers make of the reply in the message, plus `address` as the device's
  /// address. A refused value drops everything stored before it, so nothing is returned when the
  /// last entry's value is refused.
  [[nodiscard]] std::optional<Dictionary> result(const std::string& address) const;

 private:
  mib_table& table_;
  std::vector<snmp_varbind> bindings_;
  std::vector<snmp_octets> octets_;
  std::array<std::uint8_t, kReplySize> strings_{};  // of all bindings, end to end
  snmp_message message_;
};

/// Asks the device at `address`, dotted IPv4 text, for the objects of `table`. Returns nothing when
/// `table` or `address` is null, when the device refuses, when its values are unsuitable, and when
/// no proper reply comes. `out_no_reply` is set in the last case only and is never cleared. A
/// reply's error status and index are stored in the last two arguments, which may be null. Blocks
/// as snmp_exchange does.
[[nodiscard]] std::optional<Dictionary> snmp_query_table(mib_table* table, const char* address,
                                                         bool& out_no_reply,
                                                         std::int32_t* out_error_status,
                                                         std::int32_t* out_error_index);

/// The same, asking a second time when the first request gives nothing.
[[nodiscard]] std::optional<Dictionary> snmp_query_table_retry(mib_table* table,
                                                               const char* address,
                                                               bool& out_no_reply,
                                                               std::int32_t* out_error_status,
                                                               std::int32_t* out_error_index);

/// Returns whether the device with these addresses (strings) says that its active interface is the
/// wireless one. Tries the addresses in order; the first that answers every request decides. One
/// that leaves a request unanswered is tried three times, 20 ms apart, with up to two requests
/// each. When no address decides, the result of the very last try does.
///
/// Blocks: an address that swallows all six requests takes 12 seconds.
[[nodiscard]] bool snmp_active_interface_is_wireless(const Array& addresses);

/// Makes one request to the device at an address, which is null for an entry that is no text.
/// Returns what snmp_query_table does, and sets `no_reply` in the same case.
using snmp_ask = std::function<std::optional<Dictionary>(const char* address, bool& no_reply)>;

/// The same decision with requests made by `ask`, for callers that keep what is exchanged.
[[nodiscard]] bool snmp_active_interface_is_wireless(const Array& addresses, const snmp_ask& ask);

}  // namespace onramp

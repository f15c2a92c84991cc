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

/// One object to read.
struct mib_entry {
  std::uint64_t expected_type = kTagInteger;
  snmp_oid oid;  ///< the name asked for, over storage that the reply's name is decoded into
};

/// Stores the value of a reply's binding under `name`. 0, or another number when the value does not
/// do. The last argument is always 0.
using mib_decode = snmp_status (*)(Dictionary& result, const char* name,
                                   const snmp_varbind& binding, std::uint64_t reserved);

/// What becomes of the value of the entry at the same place.
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

/// Keys of a result beside those of its table's handlers.
constexpr const char* kConnectionKey = "Connection";  ///< string, always "Network"
constexpr const char* kIPAddressKey = "IPaddress";    ///< string, the device's address

constexpr const char* kActiveIFKey = "ActiveIF";
constexpr std::int64_t kActiveIFWireless = 2;

/// Asks for a device's active interface: ActiveIF, an integer. The name that a reply carries
/// becomes the name of later requests, and a shorter one leaves room for no more arcs than it has.
extern mib_table active_interface_table;

/// Stores an INTEGER as a number of 32 bits; 1 for a value of any other type.
[[nodiscard]] snmp_status decode_active_if(Dictionary& dictionary, const char* name,
                                           const snmp_varbind& binding, std::uint64_t reserved);

/// A get request for the objects of a table, and the storage of its replies.
class snmp_table_request {
 public:
  explicit snmp_table_request(mib_table& table);
  snmp_table_request(const snmp_table_request&) = delete;
  snmp_table_request& operator=(const snmp_table_request&) = delete;
  ~snmp_table_request() = default;

  /// To be sent, and to be decoded into. Its `request_id` is the caller's to set.
  [[nodiscard]] snmp_message& message() { return message_; }

  /// Forgets the values of the reply before, so that another one can be decoded into the message.
  void clear_values();

  /// The result of the reply in the message: what the handlers store, and as the device's address
  /// `address`. Nothing when the reply's names do not match the table's, or when the last entry's
  /// handler refused its value; a refused value also drops those before it.
  [[nodiscard]] std::optional<Dictionary> result(const std::string& address) const;

 private:
  mib_table& table_;
  std::vector<snmp_varbind> bindings_;
  std::vector<snmp_octets> octets_;
  std::array<std::uint8_t, kReplySize> strings_{};  // of all bindings, end to end
  snmp_message message_;
};

/// Asks the device at `address`, dotted IPv4 text, for the objects of `table`. Nothing without a
/// table or an address, when the device refuses or its values do not do, and when it gives no
/// proper answer, in which case alone `out_no_reply` is set; it is never cleared. The error status
/// and index of an answer go to the other two, which may be null. Blocks as snmp_exchange does.
[[nodiscard]] std::optional<Dictionary> snmp_query_table(mib_table* table, const char* address,
                                                         bool& out_no_reply,
                                                         std::int32_t* out_error_status,
                                                         std::int32_t* out_error_index);

/// The same, asking a second time when the first gives nothing.
[[nodiscard]] std::optional<Dictionary> snmp_query_table_retry(mib_table* table,
                                                               const char* address,
                                                               bool& out_no_reply,
                                                               std::int32_t* out_error_status,
                                                               std::int32_t* out_error_index);

/// Whether the device with these addresses (strings) says that its active interface is the wireless
/// one. Addresses are tried in order until one answers at the first request; one that leaves a
/// request unanswered is asked three times, 20 ms apart, and its last answer counts when no further
/// address decides.
[[nodiscard]] bool snmp_active_interface_is_wireless(const Array& addresses);

/// Makes one request to the device at an address, which is null for an entry that is no text.
/// Returns what snmp_query_table does, and sets `no_reply` in the same case.
using snmp_ask =
    std::function<std::optional<Dictionary>(const char* address, bool& no_reply)>;

/// The same decision with requests made by `ask`, for callers that keep what is exchanged.
[[nodiscard]] bool snmp_active_interface_is_wireless(const Array& addresses, const snmp_ask& ask);

}  // namespace onramp

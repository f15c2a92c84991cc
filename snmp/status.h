#pragma once

namespace onramp {

/// What every operation of this room answers: 0 for success, or one of the numbers below. A few
/// operations also hand on the error status of a reply (RFC 1157 section 4.1.1).
using snmp_status = unsigned;

constexpr snmp_status SNMP_OK = 0;
constexpr snmp_status SNMP_ERR_TRANSPORT = 1;  ///< no socket, or a reply to another request
constexpr snmp_status SNMP_ERR_CODEC = 5;      ///< malformed, or beyond the storage given for it

}  // namespace onramp

#pragma once

namespace onramp {

/// What the operations of this room return: 0 for success, or one of the numbers below. A few also
/// return the error status of a reply (RFC 1157 section 4.1.1).
using snmp_status = unsigned;

constexpr snmp_status SNMP_OK = 0;
constexpr snmp_status SNMP_ERR_TRANSPORT =
    1;                                     ///< no socket, no address, or another request's reply
constexpr snmp_status SNMP_ERR_CODEC = 5;  ///< malformed or missing, or more than there is room for

}  // namespace onramp

#pragma once

namespace onramp {

/// The result of an SNMP function: SNMP_OK or one of the errors below. snmp_get and snmp_set may
/// also return the error status of a reply (RFC 1157 section 4.1.1).
using snmp_status = unsigned;

constexpr snmp_status SNMP_OK = 0;
constexpr snmp_status SNMP_ERR_TRANSPORT =
    1;  ///< no socket, no message, no usable address, or a reply to another request
constexpr snmp_status SNMP_ERR_CODEC = 5;  ///< malformed or missing data, or too little room

}  // namespace onramp

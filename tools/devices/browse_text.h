#pragma once

#include <string>

#include "tools/devices/browse_result.h"

namespace onramp::devices {

/// The form of the text output.
struct TextStyle {
  bool isColoured = false;
  bool isVerbose = false;
  std::size_t width = 0;  ///< columns of the terminal; 0 when the output is not a terminal
};

/// Returns the style for standard output: with colours and the terminal's width if it is a
/// terminal, otherwise without colours and with width 0.
[[nodiscard]] TextStyle outputStyle(bool isVerbose);

/// Returns the header line of the table of devices. If the search is for all models, but the wizard
/// on `medium` searches for one model at a time, a paragraph before the line says so.
[[nodiscard]] std::string tableHead(const Medium& medium, const TextStyle& style);

/// Returns a device's row in the table and the lines below the row: the reason (if the
/// wizard does not list the device), the notes and (in the verbose style) all details.
[[nodiscard]] std::string rowOf(const JudgedDevice& device, const TextStyle& style);

/// Returns the row for a device that is no longer announced.
[[nodiscard]] std::string goneRow(const Device& device, const TextStyle& style);

/// Returns the last lines of the output: delays, missed devices, network problems and the numbers
/// of devices.
[[nodiscard]] std::string summaryOf(const BrowseResult& result, const TextStyle& style);

/// Returns a request and its reply as trees and in hexadecimal, indented by `indent` spaces. A
/// request or reply without bytes is left out.
[[nodiscard]] std::string packetsOf(const Exchange& exchange, std::size_t indent);

/// Returns an exchange as one line without a line feed: the address, the value or what went wrong,
/// and the duration, such as "127.0.1.5: 2 after 0.4 ms".
[[nodiscard]] std::string exchangeLine(const Exchange& exchange);

}  // namespace onramp::devices

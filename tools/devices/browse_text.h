#pragma once

#include <string>

#include "tools/devices/browse_result.h"

namespace onramp::devices {

/// How results are shown.
struct TextStyle {
  bool isColoured = false;
  bool isVerbose = false;
  std::size_t width = 0;  ///< columns of the terminal; 0 when the output is none
};

/// The style for standard output as it is.
[[nodiscard]] TextStyle outputStyle(bool isVerbose);

/// The head of the table of devices.
[[nodiscard]] std::string tableHead(const TextStyle& style);

/// A device's row, with its verdict below unless it is listed.
[[nodiscard]] std::string rowOf(const JudgedDevice& device, const TextStyle& style);

/// The row of a device that is no longer announced.
[[nodiscard]] std::string goneRow(const Device& device, const TextStyle& style);

/// What the whole search came to.
[[nodiscard]] std::string summaryOf(const BrowseResult& result, const TextStyle& style);

/// A request and its reply, as trees and in hexadecimal.
[[nodiscard]] std::string packetsOf(const Exchange& exchange, std::size_t indent);

/// An exchange in one line, such as "127.0.1.5: 2 after 0.4 ms".
[[nodiscard]] std::string exchangeLine(const Exchange& exchange);

}  // namespace onramp::devices

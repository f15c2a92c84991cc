#pragma once

#include <cstddef>

namespace onramp {

/// Whether standard output, or standard error, is a terminal that understands escape sequences.
[[nodiscard]] bool isOutputTerminal();
[[nodiscard]] bool isErrorTerminal();

/// The terminal's width in columns; 80 when it is unknown.
[[nodiscard]] std::size_t terminalWidth();

/// The columns that a character takes on a terminal, by the rules of the locale of the process.
[[nodiscard]] std::size_t columnsOf(char32_t character);

}  // namespace onramp

#pragma once

#include <cstddef>

namespace onramp {

/// Returns whether standard output is a terminal that understands escape sequences.
[[nodiscard]] bool isOutputTerminal();

/// Returns whether standard error is a terminal that understands escape sequences.
[[nodiscard]] bool isErrorTerminal();

/// Returns the width, in columns, of the terminal that shows standard output, or 80 when the width
/// is unknown.
[[nodiscard]] std::size_t terminalWidth();

/// Returns how many columns a character takes on a terminal, according to the process's locale.
/// Returns 0 for a character that cannot be printed.
[[nodiscard]] std::size_t columnsOf(char32_t character);

}  // namespace onramp

#pragma once

#include <cstddef>

namespace onramp {

/// Both return whether a stream is a terminal that understands escape sequences. The stream is
/// standard output for the first function and standard error for the second one.
[[nodiscard]] bool isOutputTerminal();
[[nodiscard]] bool isErrorTerminal();

/// Returns the width, in columns, of the terminal that standard output goes to, or 80 when the
/// width is unknown.
[[nodiscard]] std::size_t terminalWidth();

/// Returns how many columns a character takes on a terminal, by the rules of the process's locale.
/// Returns 0 for a character that cannot be printed.
[[nodiscard]] std::size_t columnsOf(char32_t character);

}  // namespace onramp

#pragma once

#include <cstddef>

namespace onramp {

/// Return whether standard output or standard error, respectively, is a terminal that understands
/// escape sequences.
[[nodiscard]] bool isOutputTerminal();
[[nodiscard]] bool isErrorTerminal();

/// Returns the terminal's width in columns, or 80 when the width is unknown.
[[nodiscard]] std::size_t terminalWidth();

/// Returns how many columns a character takes on a terminal, by the rules of the process's locale.
[[nodiscard]] std::size_t columnsOf(char32_t character);

}  // namespace onramp

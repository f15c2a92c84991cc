#include "platform/terminal.h"

#include <sys/ioctl.h>
#include <unistd.h>
#include <wchar.h>

#include <cstdlib>
#include <string_view>

namespace onramp {

namespace {

constexpr std::size_t kUsualWidth = 80;

bool isTerminal(int descriptor) {
  const char* const kind = std::getenv("TERM");
  return isatty(descriptor) == 1 && kind && std::string_view(kind) != "dumb";
}

}  // namespace

bool isOutputTerminal() {
  return isTerminal(STDOUT_FILENO);
}

bool isErrorTerminal() {
  return isTerminal(STDERR_FILENO);
}

std::size_t terminalWidth() {
  winsize size{};
  if (ioctl(STDOUT_FILENO, TIOCGWINSZ, &size) != 0 || size.ws_col == 0) return kUsualWidth;
  return size.ws_col;
}

std::size_t columnsOf(char32_t character) {
  const int columns = wcwidth(static_cast<wchar_t>(character));
  return columns < 0 ? 0 : static_cast<std::size_t>(columns);
}

}  // namespace onramp

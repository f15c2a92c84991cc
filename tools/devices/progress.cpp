#include "tools/devices/progress.h"

#include <iostream>

#include "platform/terminal.h"
#include "tools/devices/text.h"
#include "tools/terminal_text.h"

namespace onramp::devices {

bool Progress::isShown() {
  return isErrorTerminal();
}

void Progress::show(const std::string& text) {
  if (!isShown()) return;
  std::string line = fitted(text, terminalWidth() - 3);
  // The cursor stays at the end of the text, so the terminal can show "^C" there.
  while (line.ends_with(' '))
    line.pop_back();
  std::cerr << '\r' << line << "\033[K" << std::flush;
  isThere_ = true;
}

void Progress::clear() {
  if (isThere_) std::cerr << "\r\033[K" << std::flush;
  isThere_ = false;
}

void Progress::print(const std::string& text) {
  clear();
  std::cout << text << std::flush;
}

}  // namespace onramp::devices

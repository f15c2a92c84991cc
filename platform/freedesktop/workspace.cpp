#include "platform/workspace.h"

#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <optional>
#include <string_view>
#include <system_error>
#include <thread>

#include "platform/posix/process.h"

namespace onramp {

namespace {

std::optional<std::string> programOnPath(std::string_view name) {
  const char* const list = std::getenv("PATH");
  for (std::string_view rest = list ? list : ""; !rest.empty();) {
    const std::size_t end = rest.find(':');
    const std::string folder(rest.substr(0, end));
    rest.remove_prefix(end == std::string_view::npos ? rest.size() : end + 1);
    // An empty entry means the current folder. Running programs from there would be unsafe.
    if (folder.empty()) continue;
    std::string program = folder + "/" + std::string(name);
    std::error_code ignored;
    if (std::filesystem::is_regular_file(program, ignored) && access(program.c_str(), X_OK) == 0) {
      return program;
    }
  }
  return std::nullopt;
}

bool openWithDesktop(const std::string& target) {
  const auto opener = programOnPath("xdg-open");
  const auto process = opener ? startProcess(*opener, {target}, Session::kOwn) : std::nullopt;
  if (!process) return false;
  // A thread waits for the process, which would otherwise remain as a zombie until this program
  // exits. If the thread cannot be created, the zombie remains, which is harmless.
  try {
    std::thread([process] { waitForProcess(*process); }).detach();
  } catch (const std::system_error&) {
  }
  return true;
}

}  // namespace

bool openFile(const std::string& path) {
  // With the prefix "./", xdg-open does not mistake a relative path for an option or a URL.
  return openWithDesktop(path.starts_with('/') ? path : "./" + path);
}

bool openURL(const std::string& url) {
  return !url.starts_with('-') && openWithDesktop(url);
}

}  // namespace onramp

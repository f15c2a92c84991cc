#include "platform/folders.h"

#include <pwd.h>
#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <string_view>
#include <system_error>

namespace onramp {

namespace {

// Returns `path` without its trailing slashes if it is absolute. Otherwise returns an empty string,
// because programs must ignore relative paths in the XDG base directory variables.
std::string absolutePath(std::string_view path) {
  while (path.size() > 1 && path.ends_with('/'))
    path.remove_suffix(1);
  return path.starts_with('/') ? std::string(path) : std::string();
}

std::string environmentPath(const char* name) {
  const char* const value = std::getenv(name);
  return value ? absolutePath(value) : std::string();
}

std::string homeFolder() {
  if (std::string home = environmentPath("HOME"); !home.empty()) return home;
  const passwd* const user = getpwuid(getuid());
  return user ? absolutePath(user->pw_dir) : std::string();
}

std::string userFolder() {
  const std::string folder = environmentPath("XDG_DATA_HOME");
  return folder.empty() ? homeFolder() + "/.local/share" : folder;
}

std::string localFolder() {
  const char* const list = std::getenv("XDG_DATA_DIRS");
  for (std::string_view rest = list ? list : ""; !rest.empty();) {
    const std::size_t end = rest.find(':');
    if (std::string folder = absolutePath(rest.substr(0, end)); !folder.empty()) return folder;
    rest.remove_prefix(end == std::string_view::npos ? rest.size() : end + 1);
  }
  return "/usr/local/share";
}

}  // namespace

std::string applicationSupportFolder(FolderDomain domain) {
  std::string folder = domain == FolderDomain::kUser ? userFolder() : localFolder();
  std::error_code ignored;
  std::filesystem::create_directories(folder, ignored);
  return folder;
}

}  // namespace onramp

#include "platform/freedesktop/main_bundle.h"

#include <filesystem>
#include <system_error>
#include <utility>

namespace onramp {

namespace {

namespace fs = std::filesystem;

std::string bundleOfExecutable() {
  std::error_code ignored;
  const fs::path folder = fs::read_symlink("/proc/self/exe", ignored).parent_path();
  const fs::path contents = folder.parent_path();
  return contents.filename() == "Contents" ? contents.parent_path().string() : folder.string();
}

std::string& storedPath() {
  static std::string path = bundleOfExecutable();
  return path;
}

}  // namespace

void setMainBundlePath(std::string path) {
  storedPath() = std::move(path);
}

std::string mainBundlePath() {
  return storedPath();
}

}  // namespace onramp

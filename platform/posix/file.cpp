#include "platform/posix/file.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>

#include "platform/posix/descriptor.h"

namespace onramp::posix {

namespace {

// A new file of a name that nothing beside `path` has; its access rights follow the user's mask.
Descriptor createBeside(const std::string& path, std::string& name) {
  constexpr int kMostTries = 100;  // a killed process may have left some of them
  const std::size_t last = path.rfind('/') + 1;
  const std::string stem =
      path.substr(0, last) + "." + path.substr(last) + "." + std::to_string(getpid()) + "-";
  for (int i = 0; i < kMostTries; ++i) {
    name = stem + std::to_string(i);
    Descriptor file(open(name.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0666));
    if (file || errno != EEXIST) return file;
  }
  return Descriptor();
}

bool writeAll(int descriptor, std::string_view bytes) {
  while (!bytes.empty()) {
    const ssize_t written = write(descriptor, bytes.data(), bytes.size());
    if (written < 0 && errno == EINTR) continue;
    if (written < 0) return false;
    bytes.remove_prefix(static_cast<std::size_t>(written));
  }
  return true;
}

}  // namespace

std::optional<std::string> readFile(const std::string& path, std::size_t most) {
  const Descriptor file(open(path.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC));
  struct stat status {};
  if (!file || fstat(file.get(), &status) != 0 || !S_ISREG(status.st_mode)) return std::nullopt;
  if (status.st_size < 0 || static_cast<std::size_t>(status.st_size) > most) return std::nullopt;

  std::string bytes(static_cast<std::size_t>(status.st_size), '\0');
  std::size_t filled = 0;
  while (filled < bytes.size()) {
    const ssize_t got = read(file.get(), bytes.data() + filled, bytes.size() - filled);
    if (got < 0 && errno == EINTR) continue;
    if (got < 0) return std::nullopt;
    if (got == 0) break;
    filled += static_cast<std::size_t>(got);
  }
  bytes.resize(filled);
  return bytes;
}

bool writeFileAtomically(const std::string& path, std::string_view bytes) {
  std::string temporary;
  Descriptor file = createBeside(path, temporary);
  if (!file) return false;
  const bool written = writeAll(file.get(), bytes) && fsync(file.get()) == 0;
  const bool closed = file.close();
  if (written && closed && std::rename(temporary.c_str(), path.c_str()) == 0) return true;
  unlink(temporary.c_str());
  return false;
}

}  // namespace onramp::posix

#include "platform/posix/file.h"

#include <fcntl.h>
#include <signal.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <charconv>
#include <cstdio>
#include <filesystem>
#include <system_error>
#include <vector>

#include "platform/posix/descriptor.h"

namespace onramp::posix {

namespace {

namespace fs = std::filesystem;

// Returns ".NAME.", with which the names of all temporary files for `path` begin. A full name is
// ".NAME.PROCESS-NUMBER", where NAME is the file name in `path`, and PROCESS is the writer's
// process ID. NAME is cut short so that the full name has at most 255 bytes, the usual limit.
std::string temporaryStem(const fs::path& path) {
  constexpr std::size_t kMostNameBytes = 200;
  return "." + path.filename().string().substr(0, kMostNameBytes) + ".";
}

// Creates a file with an unused name next to `path`, and stores the new file's path in `name`. The
// umask determines the file's access rights. Returns an empty descriptor on failure.
Descriptor createBeside(const fs::path& path, std::string& name) {
  constexpr int kMostTries = 100;  // killed processes may have left files with these names
  const std::string stem =
      (path.parent_path() / temporaryStem(path)).string() + std::to_string(getpid()) + "-";
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
    if (written <= 0) return false;
    bytes.remove_prefix(static_cast<std::size_t>(written));
  }
  return true;
}

// Returns whether the writer of the temporary file whose name ends with `processAndNumber` is gone.
// A file with this process's ID counts as left over, because only an earlier process with the same
// ID can have left it. Returns false when `processAndNumber` is malformed.
bool isLeftOver(std::string_view processAndNumber) {
  constexpr std::string_view kDigits = "0123456789";
  const std::size_t dash = processAndNumber.find('-');
  if (dash == std::string_view::npos || dash == 0) return false;
  const std::string_view process = processAndNumber.substr(0, dash);
  const std::string_view number = processAndNumber.substr(dash + 1);
  if (number.empty() || process.find_first_not_of(kDigits) != std::string_view::npos ||
      number.find_first_not_of(kDigits) != std::string_view::npos) {
    return false;
  }
  pid_t writer = 0;
  const auto read = std::from_chars(process.data(), process.data() + process.size(), writer);
  if (read.ec != std::errc() || writer <= 0) return false;
  return writer == getpid() || (kill(writer, 0) != 0 && errno == ESRCH);
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

void removeWithTemporaries(const std::string& path) {
  std::error_code ignored;
  // remove_all() opens `path` even if it is a file, which fails when no descriptor can be
  // created. remove() needs no descriptor, so it is tried first.
  if (!fs::remove(path, ignored)) fs::remove_all(path, ignored);
  const std::string stem = temporaryStem(path);
  std::vector<fs::path> leftOver;
  std::error_code error;
  fs::directory_iterator entry(fs::path(path).parent_path(), error);
  for (; !error && entry != fs::directory_iterator(); entry.increment(error)) {
    const std::string name = entry->path().filename().string();
    if (name.starts_with(stem) && isLeftOver(std::string_view(name).substr(stem.size()))) {
      leftOver.push_back(entry->path());
    }
  }
  for (const fs::path& file : leftOver)
    fs::remove(file, ignored);
}

}  // namespace onramp::posix

#include "platform/posix/process.h"

#include <signal.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>

// No header of macOS declares `environ`.
extern char** environ;  // NOLINT(readability-redundant-declaration)

namespace onramp {

namespace {

class SpawnAttributes {
 public:
  explicit SpawnAttributes(Session session) {
    posix_spawnattr_init(&attributes_);
    sigset_t signals;
    sigemptyset(&signals);
    posix_spawnattr_setsigmask(&attributes_, &signals);
    sigfillset(&signals);
    posix_spawnattr_setsigdefault(&attributes_, &signals);
    int flags = POSIX_SPAWN_SETSIGMASK | POSIX_SPAWN_SETSIGDEF;
    if (session == Session::kOwn) flags |= POSIX_SPAWN_SETSID;
    posix_spawnattr_setflags(&attributes_, static_cast<short>(flags));
  }
  SpawnAttributes(const SpawnAttributes&) = delete;
  SpawnAttributes& operator=(const SpawnAttributes&) = delete;
  ~SpawnAttributes() { posix_spawnattr_destroy(&attributes_); }

  [[nodiscard]] const posix_spawnattr_t* get() const { return &attributes_; }

 private:
  posix_spawnattr_t attributes_{};
};

}  // namespace

std::optional<pid_t> startProcess(const std::string& executable,
                                  const std::vector<std::string>& arguments, Session session) {
  std::vector<std::string> words{executable};
  words.insert(words.end(), arguments.begin(), arguments.end());
  std::vector<char*> argv;
  argv.reserve(words.size() + 1);
  for (std::string& word : words)
    argv.push_back(word.data());
  argv.push_back(nullptr);

  const SpawnAttributes attributes(session);
  pid_t process = 0;
  const int error =
      posix_spawn(&process, executable.c_str(), nullptr, attributes.get(), argv.data(), environ);
  return error == 0 ? std::optional(process) : std::nullopt;
}

std::optional<int> waitForProcess(pid_t process) {
  int status = 0;
  while (waitpid(process, &status, 0) < 0) {
    if (errno != EINTR) return std::nullopt;
  }
  return WIFEXITED(status) ? std::optional(WEXITSTATUS(status)) : std::nullopt;
}

}  // namespace onramp

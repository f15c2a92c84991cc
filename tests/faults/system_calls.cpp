// Replaces `operator new` and functions of the C library, in the program that links this file and
// in its libraries. Each replacement except close and fsync either fails or calls the original.

#include <dirent.h>
#include <dlfcn.h>
#include <pthread.h>
#include <spawn.h>
#include <sys/epoll.h>
#include <sys/eventfd.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/timerfd.h>

#include <new>
#include <string_view>
#include <utility>

#include "tests/faults/failures.h"

namespace onramp::faults {

namespace {

thread_local bool isCounting = false;
Failure planned;
std::vector<std::string> calls;

bool fails(const char* name, bool isAllocation = false) {
  if (!isCounting || isAllocation != (planned.error == ENOMEM)) return false;
  isCounting = false;  // the list of calls allocates memory, too
  calls.emplace_back(name);
  isCounting = true;
  return planned.isLasting ? calls.size() >= planned.first : calls.size() == planned.first;
}

template <typename Function>
Function* original(const char* name) {
  return reinterpret_cast<Function*>(dlsym(RTLD_NEXT, name));
}

// If the call must fail, sets `errno` and returns `failure`. Otherwise calls the original function
// `name` and returns its result; for fsync(), returns 0 instead.
template <typename Result, typename... Parameters>
Result call(const char* name, Result failure, Parameters... arguments) {
  const bool isFailing = fails(name);
  Result result{};
  // Linux closes a descriptor even when close() reports an error, so the replacement does the
  // same. The replacement for fsync() never flushes, because that would take most of the tests'
  // time and have no effect that the tests could see.
  if ((!isFailing && std::string_view(name) != "fsync") || std::string_view(name) == "close") {
    result = original<Result(Parameters...)>(name)(arguments...);
  }
  if (!isFailing) return result;
  errno = planned.error;
  return failure;
}

}  // namespace

void begin(const Failure& failure) {
  calls.clear();
  planned = failure;
  isCounting = true;
}

std::vector<std::string> end() {
  isCounting = false;
  return std::exchange(calls, {});
}

}  // namespace onramp::faults

using namespace onramp::faults;  // NOLINT(google-build-using-namespace)

[[gnu::noinline]] void* operator new(std::size_t size) {
  if (fails("new", true)) throw std::bad_alloc();
  static auto* const allocate = original<void*(std::size_t)>("_Znwm");
  return allocate(size);
}

#define ONRAMP_REPLACE(Result, name, failure, parameters, ...) \
  extern "C" Result name parameters {                          \
    return call<Result>(#name, failure, __VA_ARGS__);          \
  }

ONRAMP_REPLACE(int, open, -1, (const char* path, int flags, mode_t mode), path, flags, mode)
ONRAMP_REPLACE(int, openat, -1, (int folder, const char* path, int flags, mode_t mode), folder,
               path, flags, mode)
ONRAMP_REPLACE(DIR*, fdopendir, nullptr, (int folder), folder)
ONRAMP_REPLACE(dirent*, readdir, nullptr, (DIR * folder), folder)
ONRAMP_REPLACE(int, stat, -1, (const char* path, struct stat* status) noexcept, path, status)
ONRAMP_REPLACE(int, fstat, -1, (int file, struct stat* status) noexcept, file, status)
ONRAMP_REPLACE(int, mkdir, -1, (const char* path, mode_t mode) noexcept, path, mode)
ONRAMP_REPLACE(int, fchmodat, -1, (int folder, const char* path, mode_t mode, int flags) noexcept,
               folder, path, mode, flags)
ONRAMP_REPLACE(ssize_t, read, -1, (int file, void* bytes, std::size_t size), file, bytes, size)
ONRAMP_REPLACE(ssize_t, write, -1, (int file, const void* bytes, std::size_t size), file, bytes,
               size)
ONRAMP_REPLACE(int, fsync, -1, (int file), file)
ONRAMP_REPLACE(int, close, -1, (int file), file)
ONRAMP_REPLACE(int, rename, -1, (const char* from, const char* to) noexcept, from, to)
ONRAMP_REPLACE(int, unlink, -1, (const char* path) noexcept, path)
ONRAMP_REPLACE(int, remove, -1, (const char* path) noexcept, path)
ONRAMP_REPLACE(int, socket, -1, (int domain, int type, int protocol) noexcept, domain, type,
               protocol)
ONRAMP_REPLACE(int, eventfd, -1, (unsigned count, int flags) noexcept, count, flags)
ONRAMP_REPLACE(int, epoll_create1, -1, (int flags) noexcept, flags)
ONRAMP_REPLACE(int, timerfd_create, -1, (clockid_t clock, int flags) noexcept, clock, flags)
ONRAMP_REPLACE(int, pthread_create, planned.error,
               (pthread_t * thread, const pthread_attr_t* attributes, void* (*start)(void*),
                void* argument) noexcept,
               thread, attributes, start, argument)
ONRAMP_REPLACE(int, posix_spawn, planned.error,
               (pid_t * process, const char* path, const posix_spawn_file_actions_t* actions,
                const posix_spawnattr_t* attributes, char* const* words, char* const* environment),
               process, path, actions, attributes, words, environment)

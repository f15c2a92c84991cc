#include "platform/child_process.h"

#include "platform/posix/process.h"

namespace onramp {

std::optional<int> runAndWait(const std::string& executable,
                              const std::vector<std::string>& arguments) {
  const auto process = startProcess(executable, arguments, Session::kShared);
  return process ? waitForProcess(*process) : std::nullopt;
}

}  // namespace onramp

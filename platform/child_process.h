#pragma once

#include <optional>
#include <string>
#include <vector>

namespace onramp {

/// Runs the program at `executable` with `arguments` and blocks the calling thread until it ends.
/// Returns its exit status; nothing when it could not be started or was ended by a signal.
[[nodiscard]] std::optional<int> runAndWait(const std::string& executable,
                                            const std::vector<std::string>& arguments);

}  // namespace onramp

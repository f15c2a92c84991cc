#pragma once

#include <optional>
#include <string>
#include <vector>

namespace onramp {

/// Runs the program at `executable` with `arguments` and blocks the calling thread until the
/// program exits. Returns the program's exit status. Returns nothing when a signal terminated the
/// program, or when starting it or waiting for it failed.
[[nodiscard]] std::optional<int> runAndWait(const std::string& executable,
                                            const std::vector<std::string>& arguments);

}  // namespace onramp

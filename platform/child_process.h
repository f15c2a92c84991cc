#pragma once

#include <optional>
#include <string>
#include <vector>

namespace onramp {

/// Runs the program at `executable` with `arguments` and blocks until it ends. Its exit status;
/// nothing when it could not be started or was ended by a signal. Whether the main loop turns
/// meanwhile is up to the platform.
[[nodiscard]] std::optional<int> runAndWait(const std::string& executable,
                                            const std::vector<std::string>& arguments);

}  // namespace onramp

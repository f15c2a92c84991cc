#pragma once

#include <optional>
#include <string>
#include <vector>

namespace onramp {

/// Runs the program at `executable` with `arguments` and blocks the calling thread until the
/// program ends. Returns the program's exit status, or nothing when the program could not be
/// started or waited for, or was ended by a signal.
[[nodiscard]] std::optional<int> runAndWait(const std::string& executable,
                                            const std::vector<std::string>& arguments);

}  // namespace onramp

#pragma once

#include <optional>
#include <string>
#include <vector>

namespace onramp {

/// Runs the program at `executable` with `arguments`, blocks until it ends and returns its exit
/// status. Nothing when the program could not be started or was ended by a signal. Callers must
/// expect the user interface to freeze meanwhile.
[[nodiscard]] std::optional<int> runAndWait(const std::string& executable,
                                            const std::vector<std::string>& arguments);

}  // namespace onramp

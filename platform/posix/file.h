#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace onramp::posix {

/// The bytes of the regular file at `path`; nothing when it cannot be read, is something else than
/// a file, or is larger than `most` bytes. Never waits for somebody to write.
[[nodiscard]] std::optional<std::string> readFile(const std::string& path, std::size_t most);

/// Puts `bytes` under `path` in one step: they are written and flushed to a temporary file in the
/// same folder, which then takes the name. False when any of that failed; the temporary file is
/// then gone again and what lay at `path` is untouched.
bool writeFileAtomically(const std::string& path, std::string_view bytes);

}  // namespace onramp::posix

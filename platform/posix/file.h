#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace onramp::posix {

/// Reads the regular file at `path`. Returns nothing when the file cannot be read, is not a regular
/// file, or is larger than `most` bytes. Does not block even if `path` is a pipe.
[[nodiscard]] std::optional<std::string> readFile(const std::string& path, std::size_t most);

/// Writes `bytes` to `path` atomically: writes and flushes a temporary file in the same folder,
/// then renames it to `path`. Returns false when a step fails. In that case, the temporary file
/// is removed, and an existing file at `path` is unchanged.
bool writeFileAtomically(const std::string& path, std::string_view bytes);

/// Removes the file at `path`, or the folder at `path` with its contents. Also removes the
/// temporary files of processes that were killed while writing to `path`. Ignores failures.
void removeWithTemporaries(const std::string& path);

}  // namespace onramp::posix

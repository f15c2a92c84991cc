#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace onramp::posix {

/// The bytes of the regular file at `path`. Nothing when it cannot be read, is not a regular file,
/// or is larger than `most` bytes. Never waits for a writer.
[[nodiscard]] std::optional<std::string> readFile(const std::string& path, std::size_t most);

/// Replaces the file at `path` by one with `bytes` in a single step: a temporary file in the same
/// folder is written, flushed and renamed. False when any of that failed; the temporary file is
/// then removed and whatever lay at `path` is unchanged.
bool writeFileAtomically(const std::string& path, std::string_view bytes);

/// Removes whatever lies at `path`, a folder with all that it holds as well, and the temporary
/// files that writeFileAtomically() left for `path` in processes that no longer exist. Failures are
/// ignored.
void removeWithTemporaries(const std::string& path);

}  // namespace onramp::posix

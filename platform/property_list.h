#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>

#include "base/value.h"

namespace onramp {

// Limits for reading property lists. For comparison, a ModelInfo.plist with 5,000 models takes
// about 1.3 megabytes, has 60,000 objects (including keys) and is four containers deep. The backend
// libplist also rejects XML lists that would take too many steps to read, such as lists with more
// than about 23,000 keys in one dictionary.

/// The maximum size of a file in bytes. It also limits the total size of all strings and data in a
/// list. An object of a binary list counts once for each reference to it.
inline constexpr std::size_t kMostPropertyListBytes = std::size_t{16} << 20;

/// The maximum number of objects in a list. Containers count as objects. In some backends, the keys
/// of dictionaries count, too. An object of a binary list counts once for each reference to it.
inline constexpr std::uint64_t kMostPropertyListObjects = std::uint64_t{1} << 18;

/// The maximum nesting depth of containers.
inline constexpr std::size_t kMostPropertyListDepth = 128;

/// Reads the dictionary in the XML or binary property list at `path`. Returns nothing when the file
/// is absent, unreadable or malformed, holds something other than a dictionary, or exceeds a limit.
[[nodiscard]] std::optional<Dictionary> loadDictionary(const std::string& path);

/// Writes `dictionary` to `path` as an XML property list. The write is atomic: it creates a
/// temporary file in the same folder, and then renames it to `path`. Returns false on failure,
/// for example when the folder is missing. An existing file at `path` is then unchanged. Backends
/// differ in their treatment of characters that XML does not allow.
bool writeDictionaryAtomically(const Dictionary& dictionary, const std::string& path);

/// Removes the file at `path`, or the folder at `path` with its contents. Also removes the
/// temporary files of processes that were killed while writing to `path`. Ignores failures.
void removeDictionary(const std::string& path);

}  // namespace onramp

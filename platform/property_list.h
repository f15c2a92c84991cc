#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>

#include "base/value.h"

namespace onramp {

// Limits on the property lists that are read. For comparison, the ModelInfo.plist of a medium with
// 5,000 models takes about 1.3 megabytes and 60,000 objects, keys included, nested four levels
// deep. With libplist, an XML list is also refused if reading it would take too many steps, for
// example if one dictionary has more than about 23,000 keys.

/// The maximum size of a file in bytes. It also limits the total size of all texts and data in a
/// list, where a shared object of a binary list counts once for each reference to it.
inline constexpr std::size_t kMostPropertyListBytes = std::size_t{16} << 20;

/// The maximum number of objects in a list. Containers count as objects, and in some backends so do
/// the keys of dictionaries. A shared object counts once for each reference to it.
inline constexpr std::uint64_t kMostPropertyListObjects = std::uint64_t{1} << 18;

/// The maximum nesting depth of containers.
inline constexpr std::size_t kMostPropertyListDepth = 128;

/// Reads the dictionary in the XML or binary property list at `path`. Returns nothing when the file
/// is absent, unreadable or malformed, holds something other than a dictionary, or exceeds a limit.
[[nodiscard]] std::optional<Dictionary> loadDictionary(const std::string& path);

/// Writes `dictionary` to `path` as an XML property list. The write is atomic: a temporary file in
/// the same folder is completed and then renamed. Returns false on failure, for example when the
/// folder is missing. In that case a file that was at `path` is unchanged. What becomes of
/// characters that XML does not allow depends on the backend.
bool writeDictionaryAtomically(const Dictionary& dictionary, const std::string& path);

/// Removes the file or the folder tree at `path`, and the temporary files of processes that were
/// killed while they were writing to `path`. Ignores failures.
void removeDictionary(const std::string& path);

}  // namespace onramp

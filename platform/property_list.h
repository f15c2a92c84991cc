#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>

#include "base/value.h"

namespace onramp {

// The limits of a property list that is read. The description of a medium with 5,000 models takes
// about a megabyte and 60,000 objects, four levels deep.

/// Bytes of a file, and of all texts and data that the shared references of a binary list expand
/// to.
inline constexpr std::size_t kMostPropertyListBytes = std::size_t{16} << 20;

/// Containers, texts, numbers … of a list. A shared object counts wherever it is referred to.
inline constexpr std::uint64_t kMostPropertyListObjects = std::uint64_t{1} << 18;

/// Containers inside each other.
inline constexpr std::size_t kMostPropertyListDepth = 128;

/// The dictionary in the XML or binary property list at `path`. Nothing when the file is absent or
/// unreadable, holds something else, or exceeds the limits that keep a hostile file from exhausting
/// the process (size, nesting depth, number of objects).
[[nodiscard]] std::optional<Dictionary> loadDictionary(const std::string& path);

/// Writes `dictionary` as an XML property list. The file appears under its name whole or not at
/// all: a temporary file beside it is moved into place. False when it could not be written;
/// whatever lay at `path` before is then untouched.
bool writeDictionaryAtomically(const Dictionary& dictionary, const std::string& path);

/// Removes whatever lies at `path`, and the temporary files of writers of `path` that were killed.
/// Failures are ignored.
void removeDictionary(const std::string& path);

}  // namespace onramp

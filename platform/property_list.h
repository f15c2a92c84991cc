#pragma once

#include <optional>
#include <string>

#include "platform/value.h"

namespace onramp {

/// The dictionary that the XML or binary property list at `path` holds. Nothing when the file is
/// absent or unreadable, holds something else, or goes past the limits that keep a hostile file
/// from exhausting the process (size, nesting depth, number of objects).
[[nodiscard]] std::optional<Dictionary> loadDictionary(const std::string& path);

/// Writes `dictionary` as an XML property list. The file appears under its name whole or not at
/// all: a temporary file beside it is moved into place. False when it could not be written;
/// whatever lay at `path` before is then untouched.
bool writeDictionaryAtomically(const Dictionary& dictionary, const std::string& path);

}  // namespace onramp

#pragma once

#include <cstddef>
#include <cstdint>

namespace onramp::libplist {

// What a file may cost. The description of a medium with 5,000 models takes about a megabyte and
// 60,000 objects, four levels deep.

/// Bytes of a file, and of all texts and data that the shared references of a binary list expand
/// to.
inline constexpr std::size_t kMostBytes = std::size_t{16} << 20;

/// Containers, texts, numbers … of a list, a shared one counted wherever it is referred to.
inline constexpr std::uint64_t kMostObjects = std::uint64_t{1} << 18;

/// Containers inside each other.
inline constexpr std::size_t kMostDepth = 128;

/// Steps that libplist may spend where its time grows with a square: on the keys of a dictionary
/// (it hashes them into a fixed number of chains) and on the entities of a text (it moves the rest
/// of the text up at each).
inline constexpr std::uint64_t kMostSquaredSteps = std::uint64_t{1} << 29;

}  // namespace onramp::libplist

#pragma once

#include <cstddef>
#include <map>
#include <string>
#include <utility>
#include <vector>

namespace onramp::check {

/// The line numbers of keys and of the first mistake in an XML property list. The wizard's parser
/// keeps no line numbers, so a second parser, Expat, finds them. Whether the wizard can read the
/// list is for the wizard's parser alone to decide.
struct XMLLines {
  /// For each key, by the keys that lead to it: the line on which it occurs first. Keys inside
  /// arrays are left out.
  std::map<std::vector<std::string>, std::size_t> keys;
  std::vector<std::pair<std::vector<std::string>, std::size_t>> twice;  ///< keys that occur again
  std::string problem;          ///< the first mistake; empty when there is none
  std::size_t problemLine = 0;  ///< from 1
};

/// Parses `xml`, which must be UTF-8. Never fails; see `problem`.
[[nodiscard]] XMLLines xmlLines(const std::string& xml);

}  // namespace onramp::check

#pragma once

#include <cstddef>
#include <map>
#include <string>
#include <utility>
#include <vector>

namespace onramp::check {

/// The line numbers of keys and of mistakes in an XML property list. The wizard's parser keeps no
/// line numbers, so a second parser finds them. It never decides whether the wizard can read the
/// list.
struct XMLLines {
  /// The line on which each path of keys occurs first. Keys inside arrays are left out.
  std::map<std::vector<std::string>, std::size_t> keys;
  std::vector<std::pair<std::vector<std::string>, std::size_t>> twice;  ///< paths that occur again
  std::string problem;          ///< the first mistake; empty when there is none
  std::size_t problemLine = 0;  ///< from 1
};

/// Parses `xml`, which must be UTF-8.
[[nodiscard]] XMLLines xmlLines(const std::string& xml);

}  // namespace onramp::check

#pragma once

#include <cstddef>
#include <map>
#include <string>
#include <utility>
#include <vector>

namespace onramp::check {

/// The line numbers of keys and of the first mistake in an XML property list. The wizard's parser
/// keeps no line numbers, so a second parser, Expat, finds them. Only the wizard's parser decides
/// whether the wizard can read the list.
struct XMLLines {
  /// The line on which each key first occurs, by the key's path. A path holds the keys from the one
  /// in the outermost dictionary to the key itself. Keys inside arrays are left out.
  std::map<std::vector<std::string>, std::size_t> keys;
  /// The path and line of each key that repeats an earlier key of the same dictionary. Keys inside
  /// arrays and inside the value of a repeated key are left out.
  std::vector<std::pair<std::vector<std::string>, std::size_t>> twice;
  std::string problem;          ///< the first mistake; empty when there is none
  std::size_t problemLine = 0;  ///< counted from 1; 0 when there is no mistake
};

/// Returns whether `text` begins like XML.
[[nodiscard]] bool isXML(const std::string& text);

/// Parses `xml`, which must be UTF-8. A mistake in `xml` is described in the result.
[[nodiscard]] XMLLines xmlLines(const std::string& xml);

}  // namespace onramp::check

#pragma once

#include <cstddef>
#include <map>
#include <string>
#include <utility>
#include <vector>

namespace onramp::check {

/// The line numbers of keys and of mistakes in an XML property list. They come from another parser
/// than the wizard's, which keeps no line numbers. They never decide whether the wizard can read
/// the list.
struct XMLLines {
  std::map<std::vector<std::string>, std::size_t> keys;  ///< the line of every path of keys
  std::vector<std::pair<std::vector<std::string>, std::size_t>> twice;  ///< repeated paths
  std::string problem;          ///< the first mistake; empty when there is none
  std::size_t problemLine = 0;  ///< from 1
};

/// Parses `xml`, which must be UTF-8.
[[nodiscard]] XMLLines xmlLines(const std::string& xml);

}  // namespace onramp::check

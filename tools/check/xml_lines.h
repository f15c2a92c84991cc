#pragma once

#include <cstddef>
#include <map>
#include <string>
#include <utility>
#include <vector>

namespace onramp::check {

/// What a closer look at an XML property list tells. It reads it with another parser than the
/// wizard, which knows no lines, and so never decides whether the wizard can read it.
struct XMLLines {
  std::map<std::vector<std::string>, std::size_t> keys;  ///< the line of every path of keys
  std::vector<std::pair<std::vector<std::string>, std::size_t>> twice;  ///< paths met again
  std::string problem;          ///< empty when nothing is wrong
  std::size_t problemLine = 0;  ///< from 1
};

/// `xml` is UTF-8.
[[nodiscard]] XMLLines xmlLines(const std::string& xml);

}  // namespace onramp::check

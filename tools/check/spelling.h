#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace onramp::check {

/// Finds the known word that a misspelt one was meant to be. Words that differ in capitals, blanks
/// and punctuation only are found at once; others are compared one by one, and as that takes time
/// with the square of their number, only up to a fixed amount of work.
class Spelling {
 public:
  explicit Spelling(const std::vector<std::string>& known);

  /// The nearest known word, if one is near enough; of equally near ones the first.
  [[nodiscard]] std::optional<std::string> nearest(std::string_view word);

 private:
  const std::vector<std::string> known_;
  std::unordered_map<std::string, std::size_t> byLetters_;
  std::size_t work_ = 0;
};

/// How many letters have to be inserted, removed, replaced or swapped with their neighbour to turn
/// `a` into `b`, capitals ignored; `most` + 1 when more than `most`.
[[nodiscard]] std::size_t editDistance(std::string_view a, std::string_view b, std::size_t most);

}  // namespace onramp::check

#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace onramp::check {

/// Finds the known word that a misspelt word was probably meant to be. A hash table finds a word
/// that differs only in capital letters, spaces and punctuation. Any other word is compared with
/// every known word. The work for all comparisons together is limited, because it would grow with
/// the product of the two lists' lengths. Beyond the limit, known words are overlooked.
class Spelling {
 public:
  explicit Spelling(const std::vector<std::string>& known);

  /// Returns the most similar known word, or nothing if none is similar enough. If several are
  /// equally similar, returns the first of them. A word from the hash table counts as equal.
  [[nodiscard]] std::optional<std::string> nearest(std::string_view word);

 private:
  const std::vector<std::string> known_;
  std::unordered_map<std::string, std::size_t> byLetters_;
  std::size_t work_ = 0;
};

/// Returns the least number of insertions, removals and replacements of bytes, and swaps of
/// neighbouring bytes, that turn `a` into `b`. Ignores the case of ASCII letters. Returns `most` +
/// 1 when that number is greater than `most`.
[[nodiscard]] std::size_t editDistance(std::string_view a, std::string_view b, std::size_t most);

}  // namespace onramp::check

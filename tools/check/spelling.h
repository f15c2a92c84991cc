#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace onramp::check {

/// Finds the known word for which a misspelt word probably stands. If the two differ only in case,
/// spaces and punctuation, a hash table finds the known word. Otherwise the misspelt word is
/// compared with every known word. Each object limits the total work of these comparisons, because
/// comparing many misspelt words with many known words would take too long. Above that limit,
/// nearest() finds only words with the same letters, in any order.
class Spelling {
 public:
  explicit Spelling(const std::vector<std::string>& known);

  /// Returns the known word that is most similar to `word`. A word from the hash table counts as
  /// the most similar. If several words are equally similar, returns the first of them. If no word
  /// is similar enough and `word` has at least six letters, returns a word with the same letters in
  /// another order, such as "SystemMin" for "MinSystem". Returns nothing if there is no such word.
  [[nodiscard]] std::optional<std::string> nearest(std::string_view word);

 private:
  const std::vector<std::string> known_;
  std::unordered_map<std::string, std::size_t> byLetters_;
  std::unordered_map<std::string, std::size_t> bySortedLetters_;
  std::size_t work_ = 0;
};

/// Returns the smallest number of changes that turn `a` into `b`. A change inserts, removes or
/// replaces one byte, or swaps two neighbouring bytes. No byte may be changed twice. ASCII letters
/// that differ only in case are equal. Returns `most` + 1 when more than `most` changes are needed.
[[nodiscard]] std::size_t editDistance(std::string_view a, std::string_view b, std::size_t most);

}  // namespace onramp::check

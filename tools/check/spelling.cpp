#include "tools/check/spelling.h"

#include <algorithm>

#include "base/ascii.h"

namespace onramp::check {

namespace {

// The number of pairs of bytes after which a Spelling object makes no more comparisons.
constexpr std::size_t kMostWork = 20'000'000;
// Shorter words often have the same letters by chance.
constexpr std::size_t kFewestToSwap = 6;

std::string lettersOf(std::string_view word) {
  std::string letters;
  for (const char c : word) {
    const bool ignored = static_cast<unsigned char>(c) < 0x80 && !isASCIILetterOrDigit(c);
    if (!ignored) letters += asciiLowercased(c);
  }
  return letters;
}

// Returns the letters in alphabetical order. Words whose parts are swapped then become equal.
std::string sortedLettersOf(std::string_view word) {
  std::string letters = lettersOf(word);
  std::sort(letters.begin(), letters.end());
  return letters;
}

}  // namespace

std::size_t editDistance(std::string_view a, std::string_view b, std::size_t most) {
  const std::size_t difference = a.size() > b.size() ? a.size() - b.size() : b.size() - a.size();
  if (difference > most) return most + 1;
  std::vector<std::size_t> before(b.size() + 1);
  std::vector<std::size_t> last(b.size() + 1);
  std::vector<std::size_t> row(b.size() + 1);
  for (std::size_t j = 0; j <= b.size(); ++j)
    last[j] = j;
  const auto same = [&](std::size_t i, std::size_t j) {
    return asciiLowercased(a[i - 1]) == asciiLowercased(b[j - 1]);
  };
  for (std::size_t i = 1; i <= a.size(); ++i) {
    row[0] = i;
    for (std::size_t j = 1; j <= b.size(); ++j) {
      row[j] = std::min({last[j] + 1, row[j - 1] + 1, last[j - 1] + (same(i, j) ? 0U : 1U)});
      if (i > 1 && j > 1 && same(i, j - 1) && same(i - 1, j)) {
        row[j] = std::min(row[j], before[j - 2] + 1);
      }
    }
    if (*std::min_element(row.begin(), row.end()) > most) return most + 1;
    before.swap(last);
    last.swap(row);
  }
  return std::min(last[b.size()], most + 1);
}

Spelling::Spelling(const std::vector<std::string>& known) : known_(known) {
  for (std::size_t i = 0; i < known_.size(); ++i)
    byLetters_.try_emplace(lettersOf(known_[i]), i);
  for (std::size_t i = 0; i < known_.size(); ++i)
    bySortedLetters_.try_emplace(sortedLettersOf(known_[i]), i);
}

std::optional<std::string> Spelling::nearest(std::string_view word) {
  const std::string letters = lettersOf(word);
  const auto found = byLetters_.find(letters);
  if (found != byLetters_.end() && !letters.empty()) return known_[found->second];
  std::size_t best = std::max<std::size_t>(1, word.size() / 4) + 1;
  std::optional<std::string> nearest;
  for (const std::string& candidate : known_) {
    if (work_ > kMostWork) break;
    work_ += word.size() * candidate.size();
    const std::size_t distance = editDistance(word, candidate, best - 1);
    if (distance >= best) continue;
    best = distance;
    nearest = candidate;
    if (best == 0) break;
  }
  const auto swapped = bySortedLetters_.find(sortedLettersOf(word));
  const bool isSwapped = swapped != bySortedLetters_.end() && letters.size() >= kFewestToSwap;
  return !nearest && isSwapped ? known_[swapped->second] : nearest;
}

}  // namespace onramp::check

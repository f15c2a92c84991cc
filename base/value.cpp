#include "base/value.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace onramp {

namespace {

std::int64_t saturated(double number) {
  constexpr double kLimit = 9223372036854775808.0;  // 2^63, the first value above the range
  if (std::isnan(number)) return 0;
  if (number >= kLimit) return std::numeric_limits<std::int64_t>::max();
  if (number < -kLimit) return std::numeric_limits<std::int64_t>::min();
  return static_cast<std::int64_t>(number);
}

bool keyIsLess(const Dictionary::Pair& pair, std::string_view key) {
  return pair.key < key;
}

}  // namespace

std::int64_t leadingInteger(std::string_view text) {
  std::size_t at = text.find_first_not_of(" \t\n\v\f\r");
  if (at == std::string_view::npos) return 0;
  const bool negative = text[at] == '-';
  if (negative || text[at] == '+') ++at;

  // Accumulates a negative number, because -2^63 is in the range, but 2^63 is not.
  constexpr std::int64_t kMin = std::numeric_limits<std::int64_t>::min();
  std::int64_t number = 0;
  for (; at < text.size() && text[at] >= '0' && text[at] <= '9'; ++at) {
    const int digit = text[at] - '0';
    if (number < (kMin + digit) / 10) {
      number = kMin;
      break;
    }
    number = number * 10 - digit;
  }
  if (negative) return number;
  return number == kMin ? std::numeric_limits<std::int64_t>::max() : -number;
}

Dictionary::Dictionary(std::initializer_list<Pair> pairs)
    : Dictionary(std::vector<Pair>(pairs.begin(), pairs.end())) {}

Dictionary::Dictionary(std::vector<Pair> pairs) {
  std::stable_sort(pairs.begin(), pairs.end(),
                   [](const Pair& a, const Pair& b) { return a.key < b.key; });
  pairs.erase(std::unique(pairs.begin(), pairs.end(),
                          [](const Pair& a, const Pair& b) { return a.key == b.key; }),
              pairs.end());
  if (!pairs.empty()) pairs_ = std::make_shared<const std::vector<Pair>>(std::move(pairs));
}

const Value* Dictionary::find(std::string_view key) const {
  const Pair* const found = std::lower_bound(begin(), end(), key, keyIsLess);
  return found != end() && found->key == key ? &found->value : nullptr;
}

std::optional<std::string> Dictionary::string(std::string_view key) const {
  const Value* const value = find(key);
  const auto* const text = value ? value->as<std::string>() : nullptr;
  return text ? std::optional(*text) : std::nullopt;
}

std::optional<Dictionary> Dictionary::dictionary(std::string_view key) const {
  const Value* const value = find(key);
  const auto* const inner = value ? value->as<Dictionary>() : nullptr;
  return inner ? std::optional(*inner) : std::nullopt;
}

const Array* Dictionary::array(std::string_view key) const {
  const Value* const value = find(key);
  return value ? value->as<Array>() : nullptr;
}

std::optional<bool> Dictionary::boolean(std::string_view key) const {
  const Value* const value = find(key);
  return value ? value->boolean() : std::nullopt;
}

std::int64_t Dictionary::integerValue(std::string_view key) const {
  const Value* const value = find(key);
  return value ? value->integerValue() : 0;
}

Dictionary Dictionary::with(std::string_view key, Value value) const {
  std::vector<Pair> pairs;
  pairs.reserve(size() + 1);
  pairs.emplace_back(key, std::move(value));
  pairs.insert(pairs.end(), begin(), end());
  return Dictionary(std::move(pairs));
}

std::size_t Dictionary::size() const {
  return pairs_ ? pairs_->size() : 0;
}

const Dictionary::Pair* Dictionary::begin() const {
  return pairs_ ? pairs_->data() : nullptr;
}

const Dictionary::Pair* Dictionary::end() const {
  return pairs_ ? pairs_->data() + pairs_->size() : nullptr;
}

bool operator==(const Dictionary& a, const Dictionary& b) {
  return a.pairs_ == b.pairs_ || std::equal(a.begin(), a.end(), b.begin(), b.end());
}

Value::Value(std::uint64_t value) : storage_(value) {
  if (std::in_range<std::int64_t>(value)) storage_ = static_cast<std::int64_t>(value);
}

std::optional<bool> Value::boolean() const {
  if (const auto* flag = as<bool>()) return *flag;
  if (const auto* integer = as<std::int64_t>()) return *integer != 0;
  if (as<std::uint64_t>()) return true;
  if (const auto* real = as<double>()) return *real != 0;
  return std::nullopt;
}

std::int64_t Value::integerValue() const {
  if (const auto* flag = as<bool>()) return *flag ? 1 : 0;
  if (const auto* integer = as<std::int64_t>()) return *integer;
  if (as<std::uint64_t>()) return std::numeric_limits<std::int64_t>::max();
  if (const auto* real = as<double>()) return saturated(*real);
  if (const auto* text = as<std::string>()) return leadingInteger(*text);
  return 0;
}

}  // namespace onramp

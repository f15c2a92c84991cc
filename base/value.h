#pragma once

#include <compare>
#include <cstddef>
#include <cstdint>
#include <initializer_list>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <variant>
#include <vector>

namespace onramp {

class Value;

/// Raw bytes, as a property list's data element holds them.
using Data = std::vector<std::byte>;

/// A point in time, in seconds since 2001-01-01 00:00:00 UTC, as property lists count it.
struct Date {
  double secondsSinceReferenceDate = 0;
  friend auto operator<=>(const Date&, const Date&) = default;
};

using Array = std::vector<Value>;

/// An immutable, string-keyed record. Copies share their contents, so passing one by value is
/// cheap.
class Dictionary {
 public:
  /// A key and its value; see below.
  struct Pair;

  /// The empty dictionary.
  Dictionary() = default;

  /// Of several pairs with the same key the first one counts.
  Dictionary(std::initializer_list<Pair> pairs);
  explicit Dictionary(std::vector<Pair> pairs);

  /// The value under `key`, or null when there is none. Lives as long as this dictionary's
  /// contents.
  [[nodiscard]] const Value* find(std::string_view key) const;

  /// The value under `key` if it is a string, a dictionary, an array; nothing (or null) otherwise.
  [[nodiscard]] std::optional<std::string> string(std::string_view key) const;
  [[nodiscard]] std::optional<Dictionary> dictionary(std::string_view key) const;
  [[nodiscard]] const Array* array(std::string_view key) const;

  /// The truth of the number under `key`; nothing when it is absent or not a number.
  [[nodiscard]] std::optional<bool> boolean(std::string_view key) const;

  /// The integer reading of the value under `key`; 0 when it is absent. See Value::integerValue.
  [[nodiscard]] std::int64_t integerValue(std::string_view key) const;

  /// This dictionary with `value` under `key`, whether or not the key was there before.
  [[nodiscard]] Dictionary with(std::string_view key, Value value) const;

  [[nodiscard]] std::size_t size() const;
  [[nodiscard]] bool empty() const { return size() == 0; }

  /// Pairs in ascending byte order of their keys.
  [[nodiscard]] const Pair* begin() const;
  [[nodiscard]] const Pair* end() const;

  friend bool operator==(const Dictionary& a, const Dictionary& b);

 private:
  std::shared_ptr<const std::vector<Pair>> pairs_;
};

/// One property-list value.
class Value {
 public:
  /// An integer is signed wherever it fits; the unsigned kind holds those of 2^63 and above only.
  using Storage = std::variant<bool, std::int64_t, std::uint64_t, double, std::string, Data, Date,
                               Array, Dictionary>;

  Value(bool value) : storage_(value) {}
  Value(int value) : storage_(std::int64_t{value}) {}
  Value(std::int64_t value) : storage_(value) {}
  Value(std::uint64_t value);
  Value(double value) : storage_(value) {}
  Value(const char* value) : storage_(std::string(value)) {}
  Value(std::string value) : storage_(std::move(value)) {}
  Value(Data value) : storage_(std::move(value)) {}
  Value(Date value) : storage_(value) {}
  Value(Array value) : storage_(std::move(value)) {}
  Value(Dictionary value) : storage_(std::move(value)) {}

  [[nodiscard]] const Storage& storage() const { return storage_; }

  /// The value as that kind, or null when it is of another kind.
  template <typename Kind>
  [[nodiscard]] const Kind* as() const {
    return std::get_if<Kind>(&storage_);
  }

  /// The truth of a number (non-zero is true); nothing for a value that is no number.
  [[nodiscard]] std::optional<bool> boolean() const;

  /// A number cut to an integer and kept within the signed 64-bit range; for a string likewise its
  /// leading decimal integer, after blanks and a sign; 0 for everything else.
  [[nodiscard]] std::int64_t integerValue() const;

  friend bool operator==(const Value& a, const Value& b) { return a.storage_ == b.storage_; }

 private:
  Storage storage_;
};

struct Dictionary::Pair {
  Pair(std::string_view name, Value content) : key(name), value(std::move(content)) {}
  std::string key;
  Value value;
  friend bool operator==(const Pair& a, const Pair& b) = default;
};

/// The leading decimal integer of `text`, by the rule of Value::integerValue.
[[nodiscard]] std::int64_t leadingInteger(std::string_view text);

}  // namespace onramp

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

/// The bytes of a property list's data element.
using Data = std::vector<std::byte>;

/// A point in time, in seconds since 2001-01-01 00:00:00 UTC, the epoch of property lists.
struct Date {
  double secondsSinceReferenceDate = 0;
  friend auto operator<=>(const Date&, const Date&) = default;
};

using Array = std::vector<Value>;

/// An immutable map from string keys to values. Copies share their contents, so passing a
/// dictionary by value is cheap.
class Dictionary {
 public:
  struct Pair;

  Dictionary() = default;

  /// If several pairs have the same key, only the first pair is kept.
  Dictionary(std::initializer_list<Pair> pairs);
  explicit Dictionary(std::vector<Pair> pairs);

  /// Returns the value under `key`, or null when there is none. The pointer is valid until this
  /// dictionary and all its copies have been destroyed or assigned to.
  [[nodiscard]] const Value* find(std::string_view key) const;

  /// These functions return the value under `key` if it has the type in the function's name.
  /// Otherwise array() returns null, and string() and dictionary() return nothing. A pointer from
  /// array() stays valid for as long as one from find().
  [[nodiscard]] std::optional<std::string> string(std::string_view key) const;
  [[nodiscard]] std::optional<Dictionary> dictionary(std::string_view key) const;
  [[nodiscard]] const Array* array(std::string_view key) const;

  /// Returns the value under `key`, converted by Value::boolean(), or nothing when there is no
  /// value.
  [[nodiscard]] std::optional<bool> boolean(std::string_view key) const;

  /// Returns the value under `key`, converted by Value::integerValue(), or 0 when there is no
  /// value.
  [[nodiscard]] std::int64_t integerValue(std::string_view key) const;

  /// Returns a copy in which `key` maps to `value`, replacing any earlier value.
  [[nodiscard]] Dictionary with(std::string_view key, Value value) const;

  [[nodiscard]] std::size_t size() const;
  [[nodiscard]] bool empty() const { return size() == 0; }

  /// The pairs, sorted by the bytes of their keys in ascending order.
  [[nodiscard]] const Pair* begin() const;
  [[nodiscard]] const Pair* end() const;

  friend bool operator==(const Dictionary& a, const Dictionary& b);

 private:
  std::shared_ptr<const std::vector<Pair>> pairs_;
};

/// One property-list value.
class Value {
 public:
  /// An integer that fits in std::int64_t is stored as that type, so std::uint64_t holds only
  /// integers of 2^63 and above.
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

  /// Returns a pointer to the content if it is of type `Kind`, otherwise null. The pointer is valid
  /// until the value is assigned to or destroyed.
  template <typename Kind>
  [[nodiscard]] const Kind* as() const {
    return std::get_if<Kind>(&storage_);
  }

  /// Converts the value to a boolean. A number is true unless it is zero. Returns nothing for a
  /// value that is neither a boolean nor a number.
  [[nodiscard]] std::optional<bool> boolean() const;

  /// Converts the value to an integer. A boolean becomes 0 or 1. A real number is truncated towards
  /// zero; NaN becomes 0. A string becomes the decimal integer at its start, or 0 if there is none.
  /// ASCII white space and one sign may precede the digits. A number outside the signed 64-bit
  /// range becomes the nearest number in the range. All other types become 0.
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

/// Returns the decimal integer that `text` begins with, as Value::integerValue() does for a string.
[[nodiscard]] std::int64_t leadingInteger(std::string_view text);

}  // namespace onramp

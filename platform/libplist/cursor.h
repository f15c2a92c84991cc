#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string_view>

namespace onramp::libplist {

/// Reads big-endian numbers from bytes that it cannot be made to leave. A read past the end gives
/// nothing, and so does every later one.
class Cursor {
 public:
  /// Over `bytes`, from `offset` on; past the end, every read fails.
  Cursor(std::string_view bytes, std::uint64_t offset)
      : rest_(offset <= bytes.size() ? bytes.substr(static_cast<std::size_t>(offset))
                                     : std::string_view()),
        failed_(offset > bytes.size()) {}

  /// An unsigned number of `size` bytes, at most 8.
  std::optional<std::uint64_t> number(std::size_t size) {
    const std::optional<std::string_view> bytes = take(size);
    if (!bytes) return std::nullopt;
    std::uint64_t number = 0;
    for (const char byte : *bytes)
      number = number << 8 | static_cast<unsigned char>(byte);
    return number;
  }

  std::optional<std::string_view> take(std::uint64_t size) {
    failed_ = failed_ || size > rest_.size();
    if (failed_) return std::nullopt;
    const std::string_view taken = rest_.substr(0, static_cast<std::size_t>(size));
    rest_.remove_prefix(taken.size());
    return taken;
  }

 private:
  std::string_view rest_;
  bool failed_;
};

}  // namespace onramp::libplist

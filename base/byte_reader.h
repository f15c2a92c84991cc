#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <string_view>

namespace onramp {

/// Reads untrusted bytes, such as those from the network or the medium, from front to back and
/// never past their end. Reading more bytes than remain returns nothing and does not move the
/// reader. A copy of a reader moves independently of the original, so a copy can be used to look
/// ahead. The bytes must outlive the reader, its copies and all views that the functions return.
class ByteReader {
 public:
  explicit ByteReader(std::span<const std::byte> bytes) : rest_(bytes) {}
  explicit ByteReader(std::span<const std::uint8_t> bytes) : rest_(std::as_bytes(bytes)) {}
  explicit ByteReader(std::string_view bytes) : rest_(std::as_bytes(std::span(bytes))) {}

  [[nodiscard]] std::size_t remaining() const { return rest_.size(); }
  [[nodiscard]] bool atEnd() const { return rest_.empty(); }

  /// Reads one byte.
  [[nodiscard]] std::optional<std::uint8_t> byte() {
    if (rest_.empty()) return std::nullopt;
    const auto value = std::to_integer<std::uint8_t>(rest_.front());
    rest_ = rest_.subspan(1);
    return value;
  }

  /// Reads `count` bytes. The result is a view of the input.
  [[nodiscard]] std::optional<std::span<const std::byte>> take(std::uint64_t count) {
    if (count > rest_.size()) return std::nullopt;
    const auto taken = rest_.first(static_cast<std::size_t>(count));
    rest_ = rest_.subspan(taken.size());
    return taken;
  }

  /// Reads `count` bytes as a string. The result is a view of the input.
  [[nodiscard]] std::optional<std::string_view> text(std::uint64_t count) {
    const auto taken = take(count);
    if (!taken) return std::nullopt;
    return std::string_view(reinterpret_cast<const char*>(taken->data()), taken->size());
  }

  /// Reads an unsigned big-endian number of `size` bytes. Returns nothing when `size` is above 8.
  [[nodiscard]] std::optional<std::uint64_t> number(std::size_t size) {
    if (size > sizeof(std::uint64_t)) return std::nullopt;
    const auto bytes = take(size);
    if (!bytes) return std::nullopt;
    std::uint64_t value = 0;
    for (const std::byte byte : *bytes)
      value = value << 8 | std::to_integer<std::uint64_t>(byte);
    return value;
  }

  /// Moves past the next `count` bytes. Returns false, without moving, when fewer are left.
  [[nodiscard]] bool skip(std::uint64_t count) { return take(count).has_value(); }

 private:
  std::span<const std::byte> rest_;
};

}  // namespace onramp

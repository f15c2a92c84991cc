#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <string_view>

namespace onramp {

/// Reads bytes that come from the network or the medium, front to back and never past their end. A
/// read that does not fit returns nothing and leaves the reader where it was. A copy reads on
/// independently, so it serves to look ahead. The bytes have to outlive the reader.
class ByteReader {
 public:
  explicit ByteReader(std::span<const std::byte> bytes) : rest_(bytes) {}
  explicit ByteReader(std::span<const std::uint8_t> bytes) : rest_(std::as_bytes(bytes)) {}
  explicit ByteReader(std::string_view bytes) : rest_(std::as_bytes(std::span(bytes))) {}

  [[nodiscard]] std::size_t remaining() const { return rest_.size(); }
  [[nodiscard]] bool atEnd() const { return rest_.empty(); }

  /// The next byte.
  [[nodiscard]] std::optional<std::uint8_t> byte() {
    if (rest_.empty()) return std::nullopt;
    const auto value = std::to_integer<std::uint8_t>(rest_.front());
    rest_ = rest_.subspan(1);
    return value;
  }

  /// The next `count` bytes.
  [[nodiscard]] std::optional<std::span<const std::byte>> take(std::uint64_t count) {
    if (count > rest_.size()) return std::nullopt;
    const auto taken = rest_.first(static_cast<std::size_t>(count));
    rest_ = rest_.subspan(taken.size());
    return taken;
  }

  /// The next `count` bytes as characters.
  [[nodiscard]] std::optional<std::string_view> text(std::uint64_t count) {
    const auto taken = take(count);
    if (!taken) return std::nullopt;
    return std::string_view(reinterpret_cast<const char*>(taken->data()), taken->size());
  }

  /// The unsigned big-endian number in the next `size` bytes. A size above 8 returns nothing.
  [[nodiscard]] std::optional<std::uint64_t> number(std::size_t size) {
    if (size > sizeof(std::uint64_t)) return std::nullopt;
    const auto bytes = take(size);
    if (!bytes) return std::nullopt;
    std::uint64_t value = 0;
    for (const std::byte byte : *bytes)
      value = value << 8 | std::to_integer<std::uint64_t>(byte);
    return value;
  }

  /// Moves past the next `count` bytes; false, and no move, when fewer are left.
  [[nodiscard]] bool skip(std::uint64_t count) { return take(count).has_value(); }

  /// Makes the input end after the next `count` bytes; false, and no change, when fewer are left.
  [[nodiscard]] bool narrow(std::uint64_t count) {
    if (count > rest_.size()) return false;
    rest_ = rest_.first(static_cast<std::size_t>(count));
    return true;
  }

 private:
  std::span<const std::byte> rest_;
};

}  // namespace onramp

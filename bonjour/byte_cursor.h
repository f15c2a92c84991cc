#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>

namespace onramp {

/// Reads bytes that come from the network from front to back, never past their end. A read that
/// does not fit gives nothing and leaves the cursor where it was.
class ByteCursor {
 public:
  explicit ByteCursor(std::span<const std::byte> bytes) : rest_(bytes) {}

  [[nodiscard]] bool atEnd() const { return rest_.empty(); }

  [[nodiscard]] std::optional<std::uint8_t> byte() {
    const auto one = bytes(1);
    if (!one) return std::nullopt;
    return std::to_integer<std::uint8_t>(one->front());
  }

  [[nodiscard]] std::optional<std::span<const std::byte>> bytes(std::size_t count) {
    if (count > rest_.size()) return std::nullopt;
    const auto read = rest_.first(count);
    rest_ = rest_.subspan(count);
    return read;
  }

 private:
  std::span<const std::byte> rest_;
};

}  // namespace onramp

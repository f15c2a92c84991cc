#pragma once

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>

#include "platform/ipv4.h"

namespace onramp {

/// Where a datagram goes to or comes from.
struct DatagramEndpoint {
  IPv4Address address;
  std::uint16_t port = 0;
  friend bool operator==(const DatagramEndpoint&, const DatagramEndpoint&) = default;
};

/// A UDP socket over IPv4 on a port of the system's choice. It never blocks but in the waits, and
/// closes with its owner.
class DatagramSocket {
 public:
  struct Received {
    std::size_t length = 0;
    DatagramEndpoint sender;
  };

  /// Nothing when the system refuses a socket, or one that does not block.
  [[nodiscard]] static std::optional<DatagramSocket> open();

  DatagramSocket(DatagramSocket&& other) noexcept;
  DatagramSocket& operator=(DatagramSocket&& other) noexcept;
  DatagramSocket(const DatagramSocket&) = delete;
  DatagramSocket& operator=(const DatagramSocket&) = delete;
  ~DatagramSocket();

  /// Lets sendTo reach broadcast addresses. False when the system refuses.
  [[nodiscard]] bool permitBroadcast();

  /// Asks for room for `bytes` of datagrams that have come in and wait to be received, the system's
  /// own record of each included. The system may give less.
  void setReceiveBufferSize(std::size_t bytes);

  /// Whether the socket became ready within `timeout`.
  [[nodiscard]] bool waitWritable(std::chrono::nanoseconds timeout) const;
  [[nodiscard]] bool waitReadable(std::chrono::nanoseconds timeout) const;

  /// Sends one datagram, and whether the system took it.
  bool sendTo(const DatagramEndpoint& destination, std::span<const std::uint8_t> bytes);

  /// Takes the next datagram, of which what `buffer` has no room for is lost. Nothing when there is
  /// none, or on an error.
  [[nodiscard]] std::optional<Received> receive(std::span<std::uint8_t> buffer);

 private:
  explicit DatagramSocket(int descriptor) : descriptor_(descriptor) {}

  int descriptor_ = -1;
};

}  // namespace onramp

#pragma once

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <memory>
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

/// A UDP socket over IPv4 on a port that the system chooses. Only the two wait functions block. The
/// destructor closes the socket.
class DatagramSocket {
 public:
  struct Received {
    std::size_t length = 0;
    DatagramEndpoint sender;
  };

  /// Returns nothing when the system refuses a socket, or one that does not block.
  [[nodiscard]] static std::optional<DatagramSocket> open();

  DatagramSocket(DatagramSocket&& other) noexcept;
  DatagramSocket& operator=(DatagramSocket&& other) noexcept;
  DatagramSocket(const DatagramSocket&) = delete;
  DatagramSocket& operator=(const DatagramSocket&) = delete;
  ~DatagramSocket();

  /// Restricts the socket to `peer`: send() sends there, and datagrams from anywhere else are
  /// dropped. From then on the system also reports when the peer's host refuses a datagram, because
  /// nothing uses that port there: waitReadable() returns true and receive() returns nothing.
  /// Returns false when the system has no way to `peer`.
  [[nodiscard]] bool connect(const DatagramEndpoint& peer);

  /// Allows sendTo() to send to broadcast addresses. Returns false when the system refuses.
  [[nodiscard]] bool permitBroadcast();

  /// Asks for room for `bytes` of datagrams that wait to be received, including what the system
  /// needs to keep each. The system may give less.
  void setReceiveBufferSize(std::size_t bytes);

  /// Waits for at most `timeout`; returns whether the socket is ready.
  [[nodiscard]] bool waitWritable(std::chrono::nanoseconds timeout) const;
  [[nodiscard]] bool waitReadable(std::chrono::nanoseconds timeout) const;

  /// Sends one datagram to the peer of connect(); returns whether the system accepted it.
  bool send(std::span<const std::uint8_t> bytes);

  /// Sends one datagram from a socket without a peer; returns whether the system accepted it.
  bool sendTo(const DatagramEndpoint& destination, std::span<const std::uint8_t> bytes);

  /// Receives the next datagram. Bytes that do not fit `buffer` are lost. Returns nothing when no
  /// datagram has arrived, when the peer's host has refused one and on any other error.
  [[nodiscard]] std::optional<Received> receive(std::span<std::uint8_t> buffer);

 private:
  struct Native;  // the backend's
  explicit DatagramSocket(std::unique_ptr<Native> native);

  std::unique_ptr<Native> native_;
};

}  // namespace onramp

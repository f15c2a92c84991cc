#pragma once

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <span>

#include "platform/ipv4.h"

namespace onramp {

/// The address and port that a datagram goes to or comes from.
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

  /// Opens a socket. Returns nothing when the system refuses to open one or to make it
  /// non-blocking.
  [[nodiscard]] static std::optional<DatagramSocket> open();

  DatagramSocket(DatagramSocket&& other) noexcept;
  DatagramSocket& operator=(DatagramSocket&& other) noexcept;
  DatagramSocket(const DatagramSocket&) = delete;
  DatagramSocket& operator=(const DatagramSocket&) = delete;
  ~DatagramSocket();

  /// Restricts the socket to `peer`: send() sends to `peer`, and the system drops datagrams from
  /// anyone else. The system then also reports when the peer's host refuses a datagram because no
  /// program uses the port. In that case waitReadable() returns true and receive() returns nothing.
  /// This function returns false when the system has no route to `peer`.
  [[nodiscard]] bool connect(const DatagramEndpoint& peer);

  /// Allows sendTo() to send to broadcast addresses. Returns false when the system refuses.
  [[nodiscard]] bool permitBroadcast();

  /// Asks the system for a buffer of `bytes` for datagrams that have arrived and are not yet
  /// received. The system's overhead for each datagram counts, too. The system may provide a
  /// smaller buffer.
  void setReceiveBufferSize(std::size_t bytes);

  /// Both wait for at most `timeout` until the socket is ready to send or to receive, and return
  /// whether it is ready.
  [[nodiscard]] bool waitWritable(std::chrono::nanoseconds timeout) const;
  [[nodiscard]] bool waitReadable(std::chrono::nanoseconds timeout) const;

  /// Sends one datagram to the peer of connect(). Returns whether the system accepted the datagram.
  bool send(std::span<const std::uint8_t> bytes);

  /// Sends one datagram from a socket without a peer. Returns whether the system accepted the
  /// datagram.
  bool sendTo(const DatagramEndpoint& destination, std::span<const std::uint8_t> bytes);

  /// Receives the next datagram. Bytes that do not fit `buffer` are lost. Returns nothing when no
  /// datagram has arrived, when the peer's host has refused a datagram, or on any other error.
  [[nodiscard]] std::optional<Received> receive(std::span<std::uint8_t> buffer);

 private:
  struct Native;  // defined by the backend
  explicit DatagramSocket(std::unique_ptr<Native> native);

  std::unique_ptr<Native> native_;
};

}  // namespace onramp

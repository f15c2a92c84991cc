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

/// A UDP socket over IPv4 on a port that the system chooses. Only waitWritable() and waitReadable()
/// block. The destructor closes the socket. Any thread may use a socket, but only one thread at a
/// time.
class DatagramSocket {
 public:
  struct Received {
    std::size_t length = 0;  ///< the number of bytes that were written to the buffer
    DatagramEndpoint sender;
  };

  /// Opens a socket. Returns nothing when the system refuses to open a socket or to make the socket
  /// non-blocking.
  [[nodiscard]] static std::optional<DatagramSocket> open();

  DatagramSocket(DatagramSocket&& other) noexcept;
  DatagramSocket& operator=(DatagramSocket&& other) noexcept;
  DatagramSocket(const DatagramSocket&) = delete;
  DatagramSocket& operator=(const DatagramSocket&) = delete;
  ~DatagramSocket();

  /// Restricts the socket to `peer`: send() sends to `peer`, and the system drops datagrams from
  /// other senders. Returns false when the system refuses, for example because it has no route to
  /// `peer`. On a connected socket, the system also reports when the peer's host refuses a
  /// datagram because no program uses the port. After such a report, waitReadable() returns true,
  /// and the next call of send() or receive() fails.
  [[nodiscard]] bool connect(const DatagramEndpoint& peer);

  /// Allows sendTo() to send to broadcast addresses. Returns false when the system refuses.
  [[nodiscard]] bool permitBroadcast();

  /// Asks the system for a buffer of `bytes` bytes for datagrams that receive() has not fetched
  /// yet. The system may provide a smaller buffer, and also stores its own data about each datagram
  /// in the buffer.
  void setReceiveBufferSize(std::size_t bytes);

  /// waitWritable() waits until the socket can send a datagram or has an error to report.
  /// waitReadable() waits until there is a datagram or an error for receive(). Both wait for at
  /// most `timeout`, which must not be negative and is rounded up to whole milliseconds. They
  /// return true when the socket is ready, and false when the time is up or the wait fails.
  [[nodiscard]] bool waitWritable(std::chrono::nanoseconds timeout) const;
  [[nodiscard]] bool waitReadable(std::chrono::nanoseconds timeout) const;

  /// Sends one datagram to the peer that connect() has set. Returns whether the system accepted the
  /// datagram.
  bool send(std::span<const std::uint8_t> bytes);

  /// Sends one datagram. Must not be called after connect(). Returns whether the system accepted
  /// the datagram.
  bool sendTo(const DatagramEndpoint& destination, std::span<const std::uint8_t> bytes);

  /// Receives the next datagram. Bytes that do not fit into `buffer` are lost. Returns nothing when
  /// no datagram has arrived, when the peer's host has refused a datagram, or on any other error.
  [[nodiscard]] std::optional<Received> receive(std::span<std::uint8_t> buffer);

 private:
  struct Native;  // defined by the backend
  explicit DatagramSocket(std::unique_ptr<Native> native);

  std::unique_ptr<Native> native_;
};

}  // namespace onramp

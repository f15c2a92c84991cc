#include "platform/datagram_socket.h"

#include <fcntl.h>
#include <netinet/in.h>
#include <poll.h>
#include <sys/socket.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <utility>

namespace onramp {

namespace {

sockaddr_in socketAddress(const DatagramEndpoint& endpoint) {
  sockaddr_in address{};
  address.sin_family = AF_INET;
  address.sin_port = htons(endpoint.port);
  address.sin_addr.s_addr = htonl(endpoint.address.bits);
  return address;
}

// A signal does not shorten the wait.
bool waitFor(int descriptor, short event, std::chrono::nanoseconds timeout) {
  using std::chrono::steady_clock;
  const auto deadline = steady_clock::now() + timeout;
  pollfd wanted{descriptor, event, 0};
  auto left = timeout;
  for (;;) {
    const auto milliseconds = std::chrono::ceil<std::chrono::milliseconds>(left);
    const int ready = ::poll(&wanted, 1, static_cast<int>(milliseconds.count()));
    if (ready >= 0 || errno != EINTR) return ready > 0;
    left = std::max<std::chrono::nanoseconds>(deadline - steady_clock::now(), {});
  }
}

}  // namespace

std::optional<DatagramSocket> DatagramSocket::open() {
  DatagramSocket socket(::socket(AF_INET, SOCK_DGRAM, 0));
  if (socket.descriptor_ < 0) return std::nullopt;
  if (::fcntl(socket.descriptor_, F_SETFL, O_NONBLOCK) != 0) return std::nullopt;
  return socket;
}

DatagramSocket::DatagramSocket(DatagramSocket&& other) noexcept
    : descriptor_(std::exchange(other.descriptor_, -1)) {}

DatagramSocket& DatagramSocket::operator=(DatagramSocket&& other) noexcept {
  std::swap(descriptor_, other.descriptor_);
  return *this;
}

DatagramSocket::~DatagramSocket() {
  if (descriptor_ >= 0) ::close(descriptor_);
}

bool DatagramSocket::permitBroadcast() {
  const int on = 1;
  return ::setsockopt(descriptor_, SOL_SOCKET, SO_BROADCAST, &on, sizeof on) == 0;
}

void DatagramSocket::setReceiveBufferSize(std::size_t bytes) {
  const int size = static_cast<int>(bytes);
  ::setsockopt(descriptor_, SOL_SOCKET, SO_RCVBUF, &size, sizeof size);
}

bool DatagramSocket::waitWritable(std::chrono::nanoseconds timeout) const {
  return waitFor(descriptor_, POLLOUT, timeout);
}

bool DatagramSocket::waitReadable(std::chrono::nanoseconds timeout) const {
  return waitFor(descriptor_, POLLIN, timeout);
}

bool DatagramSocket::sendTo(const DatagramEndpoint& destination,
                            std::span<const std::uint8_t> bytes) {
  const sockaddr_in address = socketAddress(destination);
  return ::sendto(descriptor_, bytes.data(), bytes.size(), 0,
                  reinterpret_cast<const sockaddr*>(&address), sizeof address) >= 0;
}

std::optional<DatagramSocket::Received> DatagramSocket::receive(std::span<std::uint8_t> buffer) {
  sockaddr_in sender{};
  socklen_t size = sizeof sender;
  const ssize_t length = ::recvfrom(descriptor_, buffer.data(), buffer.size(), 0,
                                    reinterpret_cast<sockaddr*>(&sender), &size);
  if (length < 0) return std::nullopt;
  return Received{static_cast<std::size_t>(length),
                  {{ntohl(sender.sin_addr.s_addr)}, ntohs(sender.sin_port)}};
}

}  // namespace onramp

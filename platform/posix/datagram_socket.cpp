#include "platform/datagram_socket.h"

#include <fcntl.h>
#include <netinet/in.h>
#include <poll.h>
#include <sys/socket.h>

#include <algorithm>
#include <cerrno>
#include <utility>

#include "platform/posix/descriptor.h"

namespace onramp {

struct DatagramSocket::Native {
  posix::Descriptor descriptor;
};

namespace {

sockaddr_in socketAddress(const DatagramEndpoint& endpoint) {
  sockaddr_in address{};
  address.sin_family = AF_INET;
  address.sin_port = htons(endpoint.port);
  address.sin_addr.s_addr = htonl(endpoint.address.bits);
  return address;
}

// Waits for `event` or an error on the descriptor, but at most for `timeout`. A signal does not
// shorten the wait. Returns false when the time is up or the wait fails.
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

DatagramSocket::DatagramSocket(std::unique_ptr<Native> native) : native_(std::move(native)) {}
DatagramSocket::DatagramSocket(DatagramSocket&& other) noexcept = default;
DatagramSocket& DatagramSocket::operator=(DatagramSocket&& other) noexcept = default;
DatagramSocket::~DatagramSocket() = default;

std::optional<DatagramSocket> DatagramSocket::open() {
  posix::Descriptor descriptor(::socket(AF_INET, SOCK_DGRAM, 0));
  if (!descriptor || ::fcntl(descriptor.get(), F_SETFL, O_NONBLOCK) != 0) return std::nullopt;
  return DatagramSocket(std::make_unique<Native>(Native{std::move(descriptor)}));
}

bool DatagramSocket::connect(const DatagramEndpoint& peer) {
  const sockaddr_in address = socketAddress(peer);
  return ::connect(native_->descriptor.get(), reinterpret_cast<const sockaddr*>(&address),
                   sizeof address) == 0;
}

bool DatagramSocket::permitBroadcast() {
  const int on = 1;
  return ::setsockopt(native_->descriptor.get(), SOL_SOCKET, SO_BROADCAST, &on, sizeof on) == 0;
}

void DatagramSocket::setReceiveBufferSize(std::size_t bytes) {
  const int size = static_cast<int>(bytes);
  ::setsockopt(native_->descriptor.get(), SOL_SOCKET, SO_RCVBUF, &size, sizeof size);
}

bool DatagramSocket::waitWritable(std::chrono::nanoseconds timeout) const {
  return waitFor(native_->descriptor.get(), POLLOUT, timeout);
}

bool DatagramSocket::waitReadable(std::chrono::nanoseconds timeout) const {
  return waitFor(native_->descriptor.get(), POLLIN, timeout);
}

bool DatagramSocket::send(std::span<const std::uint8_t> bytes) {
  return ::send(native_->descriptor.get(), bytes.data(), bytes.size(), 0) >= 0;
}

bool DatagramSocket::sendTo(const DatagramEndpoint& destination,
                            std::span<const std::uint8_t> bytes) {
  const sockaddr_in address = socketAddress(destination);
  return ::sendto(native_->descriptor.get(), bytes.data(), bytes.size(), 0,
                  reinterpret_cast<const sockaddr*>(&address), sizeof address) >= 0;
}

std::optional<DatagramSocket::Received> DatagramSocket::receive(std::span<std::uint8_t> buffer) {
  sockaddr_in sender{};
  socklen_t size = sizeof sender;
  const ssize_t length = ::recvfrom(native_->descriptor.get(), buffer.data(), buffer.size(), 0,
                                    reinterpret_cast<sockaddr*>(&sender), &size);
  if (length < 0) return std::nullopt;
  return Received{static_cast<std::size_t>(length),
                  {{ntohl(sender.sin_addr.s_addr)}, ntohs(sender.sin_port)}};
}

}  // namespace onramp

#include "platform/netlink/change_watch.h"

#include <linux/rtnetlink.h>
#include <poll.h>
#include <sys/eventfd.h>
#include <sys/socket.h>

#include <array>
#include <cerrno>
#include <cstdint>
#include <system_error>
#include <utility>

namespace onramp::netlink {

namespace {

// Reads and discards all messages waiting on the socket. The error ENOBUFS counts as a message: the
// kernel has dropped messages for which the socket's buffer was too small. Returns false when the
// socket is unusable.
bool drain(int socket) {
  for (;;) {
    std::uint8_t byte = 0;
    if (::recv(socket, &byte, sizeof byte, MSG_DONTWAIT) >= 0) continue;
    if (errno == EAGAIN) return true;
    if (errno != ENOBUFS && errno != EINTR) return false;
  }
}

}  // namespace

ChangeWatch::ChangeWatch(Socket socket)
    : socket_(std::move(socket)), stop_(::eventfd(0, EFD_CLOEXEC)) {}

std::unique_ptr<ChangeWatch> ChangeWatch::create(bool withRoutes) {
  Socket socket = openRouteSocket();
  if (!socket) return nullptr;
  if (nl_socket_add_memberships(socket.get(), RTNLGRP_LINK, RTNLGRP_IPV4_IFADDR,
                                withRoutes ? RTNLGRP_IPV4_ROUTE : RTNLGRP_NONE, RTNLGRP_NONE) < 0) {
    return nullptr;
  }
  std::unique_ptr<ChangeWatch> watch(new ChangeWatch(std::move(socket)));
  return watch->stop_ ? std::move(watch) : nullptr;
}

ChangeWatch::~ChangeWatch() {
  if (!thread_.joinable()) return;
  ::eventfd_write(stop_.get(), 1);
  thread_.join();
}

bool ChangeWatch::start(std::function<void()> changed) {
  try {
    thread_ = std::thread([this, changed = std::move(changed)] { run(changed); });
  } catch (const std::system_error&) {
    return false;
  }
  return true;
}

void ChangeWatch::run(const std::function<void()>& changed) const {
  const int socket = nl_socket_get_fd(socket_.get());
  std::array<pollfd, 2> waited{{{.fd = socket, .events = POLLIN, .revents = 0},
                                {.fd = stop_.get(), .events = POLLIN, .revents = 0}}};
  for (;;) {
    if (::poll(waited.data(), waited.size(), -1) < 0) {
      if (errno == EINTR) continue;
      return;
    }
    if (waited[1].revents != 0 || !drain(socket)) return;
    changed();
  }
}

}  // namespace onramp::netlink

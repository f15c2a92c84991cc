#include "platform/discovery_state.h"

#include <avahi-client/client.h>
#include <avahi-common/error.h>
#include <avahi-common/simple-watch.h>

#include <memory>

namespace onramp {

std::optional<std::string> discoveryProblem() {
  const std::unique_ptr<AvahiSimplePoll, decltype(&avahi_simple_poll_free)> poll(
      avahi_simple_poll_new(), avahi_simple_poll_free);
  if (!poll) return "out of memory";
  int error = 0;
  const std::unique_ptr<AvahiClient, decltype(&avahi_client_free)> client(
      avahi_client_new(avahi_simple_poll_get(poll.get()), AvahiClientFlags{}, nullptr, nullptr,
                       &error),
      avahi_client_free);
  if (client) return std::nullopt;
  return avahi_strerror(error);
}

}  // namespace onramp

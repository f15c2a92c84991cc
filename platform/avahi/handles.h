#pragma once

#include <avahi-client/client.h>
#include <avahi-client/lookup.h>
#include <avahi-common/simple-watch.h>

#include <memory>

namespace onramp::avahi {

template <auto free>
struct FreedBy {
  template <typename Object>
  void operator()(Object* object) const {
    free(object);
  }
};

template <typename Object, auto free>
using Handle = std::unique_ptr<Object, FreedBy<free>>;

using PollHandle = Handle<AvahiSimplePoll, avahi_simple_poll_free>;
using ClientHandle = Handle<AvahiClient, avahi_client_free>;
using ServiceBrowserHandle = Handle<AvahiServiceBrowser, avahi_service_browser_free>;
using ServiceResolverHandle = Handle<AvahiServiceResolver, avahi_service_resolver_free>;

}  // namespace onramp::avahi

#pragma once

#include <systemd/sd-bus.h>
#include <systemd/sd-event.h>

#include <memory>

#include "base/released_by.h"

namespace onramp::avahi {

template <typename Object, auto release>
using Handle = std::unique_ptr<Object, ReleasedBy<release>>;

using EventLoop = Handle<sd_event, sd_event_unref>;
using EventSource = Handle<sd_event_source, sd_event_source_disable_unref>;
using Bus = Handle<sd_bus, sd_bus_close_unref>;
using Message = Handle<sd_bus_message, sd_bus_message_unref>;
using Slot = Handle<sd_bus_slot, sd_bus_slot_unref>;
using Credentials = Handle<sd_bus_creds, sd_bus_creds_unref>;

}  // namespace onramp::avahi

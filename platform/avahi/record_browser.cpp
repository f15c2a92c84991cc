#include "platform/avahi/record_browser.h"

#include <string_view>
#include <utility>

namespace onramp::avahi {

namespace {

constexpr const char* kDaemon = "org.freedesktop.Avahi";
constexpr const char* kServer = "org.freedesktop.Avahi.Server2";
constexpr const char* kInterface = "org.freedesktop.Avahi.RecordBrowser";

}  // namespace

struct RecordBrowser::Object {
  Bus& bus;
  Report report;     ///< null when nobody wants to know any more
  std::string path;  ///< the daemon's name for it; empty before it has one

  void prepared(sd_bus_message* reply);
  void happened(sd_bus_message* signal) const;
  void tell(const char* method) const {
    sd_bus_call_method_async(bus.get(), nullptr, kDaemon, path.c_str(), kInterface, method, nullptr,
                             nullptr, nullptr);
  }
};

RecordBrowser::RecordBrowser(Bus& bus, AvahiIfIndex interface, const std::string& name,
                             std::uint16_t type, Report report)
    : object_(std::make_shared<Object>(Object{bus, std::move(report), {}})) {
  using Hold = std::shared_ptr<Object>;
  const auto answered = [](sd_bus_message* reply, void* hold, sd_bus_error*) {
    (*static_cast<Hold*>(hold))->prepared(reply);
    return 0;
  };
  auto hold = std::make_unique<Hold>(object_);
  sd_bus_slot* slot = nullptr;
  const int status = sd_bus_call_method_async(
      bus.get(), &slot, kDaemon, "/", kServer, "RecordBrowserPrepare", answered, hold.get(),
      "iisqqu", interface, AVAHI_PROTO_UNSPEC, name.c_str(), AVAHI_DNS_CLASS_IN, type, 0U);
  if (status < 0) return;
  sd_bus_slot_set_destroy_callback(
      slot, [](void* held) { const std::unique_ptr<Hold> freed(static_cast<Hold*>(held)); });
  static_cast<void>(hold.release());
  sd_bus_slot_set_floating(slot, 1);
  sd_bus_slot_unref(slot);
  bus.sent();
}

RecordBrowser::~RecordBrowser() {
  object_->report = nullptr;
  if (object_->path.empty()) return;
  object_->bus.forget(object_->path);
  object_->tell("Free");
  object_->bus.sent();
}

void RecordBrowser::Object::prepared(sd_bus_message* reply) {
  const char* given = nullptr;
  if (sd_bus_message_is_method_error(reply, nullptr) ||
      sd_bus_message_read(reply, "o", &given) < 0) {
    if (report) report({AVAHI_BROWSER_FAILURE});
    return;
  }
  path = given;
  if (report) bus.receive(path, [this](sd_bus_message* signal) { happened(signal); });
  tell(report ? "Start" : "Free");
}

void RecordBrowser::Object::happened(sd_bus_message* signal) const {
  const std::string_view member = sd_bus_message_get_member(signal);
  if (member == "CacheExhausted") return report({AVAHI_BROWSER_CACHE_EXHAUSTED});
  if (member == "Failure") return report({AVAHI_BROWSER_FAILURE});
  const bool isNew = member == "ItemNew";
  if (!isNew && member != "ItemRemove") return;
  std::int32_t interface = 0;
  std::int32_t protocol = 0;
  const char* name = nullptr;
  std::uint16_t recordClass = 0;
  std::uint16_t type = 0;
  const void* data = nullptr;
  std::size_t size = 0;
  if (sd_bus_message_read(signal, "iisqq", &interface, &protocol, &name, &recordClass, &type) < 0 ||
      sd_bus_message_read_array(signal, 'y', &data, &size) < 0) {
    return;
  }
  report({isNew ? AVAHI_BROWSER_NEW : AVAHI_BROWSER_REMOVE,
          protocol,
          type,
          {static_cast<const std::byte*>(data), size}});
}

}  // namespace onramp::avahi

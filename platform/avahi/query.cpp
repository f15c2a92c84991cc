#include "platform/avahi/query.h"

#include <string_view>
#include <utility>

namespace onramp::avahi {

Query::Query(Daemon& daemon, const char* kind, Arguments arguments, Handler handler)
    : daemon_(daemon), kind_(kind), arguments_(std::move(arguments)), handler_(std::move(handler)) {
  daemon_.add(this);
}

Query::~Query() {
  daemon_.remove(this);
  drop();
}

std::string Query::interface() const {
  return std::string("org.freedesktop.Avahi.") + kind_;
}

void Query::ask() {
  if (asked_ || isRefused_) return;
  const Message call = daemon_.newCall((std::string(kind_) + "Prepare").c_str());
  if (call && arguments_(call.get()) < 0) {
    isRefused_ = true;  // for example because an argument is not UTF-8
    return;
  }
  // The answer may arrive after this query has been destroyed or sent again. Nothing uses the
  // object that such a late answer names, so the object is freed.
  asked_ = std::make_shared<char>();
  const auto answer = [this, &daemon = daemon_, interface = interface(),
                       asked = std::weak_ptr(asked_)](sd_bus_message* reply) {
    if (!asked.expired()) {
      answered(reply);
      return;
    }
    const char* path = nullptr;
    if (sd_bus_message_read(reply, "o", &path) > 0) daemon.tell(path, interface.c_str(), "Free");
  };
  if (call && daemon_.call(call.get(), answer)) return;
  asked_.reset();
  daemon_.retryLater();
}

void Query::answered(sd_bus_message* reply) {
  const sd_bus_error* const error = sd_bus_message_get_error(reply);
  const char* path = nullptr;
  if (!error && sd_bus_message_read(reply, "o", &path) > 0) {
    path_ = path;
    daemon_.listen(path_, this);
    daemon_.tell(path_, interface().c_str(), "Start");
    return;
  }
  asked_.reset();
  isRefused_ = error && std::string_view(error->name).starts_with("org.freedesktop.Avahi.Invalid");
  if (!isRefused_) daemon_.retryLater();
}

void Query::signalled(sd_bus_message* signal) {
  const std::string_view member = sd_bus_message_get_member(signal);
  if (member == "ItemNew" || member == "Found") {
    handler_(Event::kFound, signal);
  } else if (member == "ItemRemove") {
    handler_(Event::kGone, signal);
  } else if (member == "CacheExhausted") {
    handler_(Event::kCacheExhausted, signal);
  } else if (member == "Failure") {
    drop();
    daemon_.retryLater();
    handler_(Event::kLost, signal);
  }
}

void Query::lost() {
  asked_.reset();
  path_.clear();
  handler_(Event::kLost, nullptr);
}

void Query::drop() {
  asked_.reset();
  if (path_.empty()) return;
  daemon_.stopListening(path_);
  daemon_.tell(path_, interface().c_str(), "Free");
  path_.clear();
}

}  // namespace onramp::avahi

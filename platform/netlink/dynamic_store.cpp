#include "platform/dynamic_store.h"

#include <utility>

#include "platform/netlink/session.h"

namespace onramp {

namespace {

thread_local int lastError = kSCStatusOK;

template <typename Result>
Result fail(int error, Result result) {
  lastError = error;
  return result;
}

}  // namespace

DynamicStoreRef createDynamicStore(const std::string&, DynamicStoreCallback callback) {
  netlink::Socket socket = netlink::openRouteSocket();
  if (!socket) return fail(kSCStatusFailed, nullptr);
  auto store = std::make_shared<DynamicStore>();
  store->socket = std::move(socket);
  store->callback = std::move(callback);
  return store;
}

std::optional<std::string> createNetworkInterfaceEntityKey(std::string_view domain,
                                                           std::string_view interface,
                                                           std::string_view entity) {
  return std::string(domain) + "/Network/Interface/" + std::string(interface) + "/" +
         std::string(entity);
}

std::optional<std::string> createNetworkGlobalEntityKey(std::string_view domain,
                                                        std::string_view entity) {
  return std::string(domain) + "/Network/Global/" + std::string(entity);
}

std::optional<Dictionary> copyMultiple(const DynamicStoreRef& store,
                                       const std::vector<std::string>& keys,
                                       const std::vector<std::string>& patterns) {
  if (!store) return fail(kSCStatusNoStoreSession, std::nullopt);
  const std::optional<netlink::Selection> selection = netlink::Selection::of(keys, patterns);
  if (!selection) return fail(kSCStatusInvalidArgument, std::nullopt);
  std::optional<Dictionary> values = selection->read(store->socket.get());
  if (!values) return fail(kSCStatusFailed, std::nullopt);
  return values;
}

bool setNotificationKeys(const DynamicStoreRef& store, const std::vector<std::string>& keys,
                         const std::vector<std::string>& patterns) {
  if (!store) return fail(kSCStatusNoStoreSession, false);
  std::optional<netlink::Selection> selection = netlink::Selection::of(keys, patterns);
  if (!selection) return fail(kSCStatusInvalidArgument, false);

  // The watch must exist before the state is read. Otherwise, changes in between would be missed.
  auto watch = netlink::ChangeWatch::create(selection->hasGlobal());
  std::optional<Dictionary> known = watch ? selection->read(store->socket.get()) : std::nullopt;
  if (!known) return fail(kSCStatusFailed, false);
  store->watch = std::move(watch);
  store->notified = std::move(*selection);
  store->known = std::move(*known);
  return store->startWatch() || fail(kSCStatusFailed, false);
}

DynamicStoreSourceRef createRunLoopSource(const DynamicStoreRef& store, int) {
  if (!store) return fail(kSCStatusNoStoreSession, nullptr);
  return std::make_shared<DynamicStoreSource>(store);
}

int lastDynamicStoreError() {
  return lastError;
}

}  // namespace onramp

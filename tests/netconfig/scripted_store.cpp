#include "tests/netconfig/scripted_store.h"

#include <utility>

namespace onramp {

namespace scripted {

Store& Store::instance() {
  static Store store;
  return store;
}

void Store::change(Dictionary newContents) {
  contents = std::move(newContents);
  callback({"State:/Network/Interface/some/IPv4"});
}

}  // namespace scripted

namespace {

scripted::Store& script() {
  return scripted::Store::instance();
}

std::string listed(const std::vector<std::string>& texts) {
  std::string list;
  for (const std::string& text : texts)
    list += " " + text;
  return list;
}

}  // namespace

struct DynamicStore {};
struct DynamicStoreSource {};

DynamicStoreRef createDynamicStore(const std::string& name, DynamicStoreCallback callback) {
  script().log.push_back((callback ? "create with callback " : "create ") + name);
  if (script().failing == scripted::Step::kCreate) return nullptr;
  if (callback) script().callback = std::move(callback);
  return std::make_shared<DynamicStore>();
}

std::optional<std::string> createNetworkInterfaceEntityKey(std::string_view domain,
                                                           std::string_view interface,
                                                           std::string_view entity) {
  if (script().failing == scripted::Step::kKey) return std::nullopt;
  return std::string(domain) + "interface:" + std::string(interface) + ":" + std::string(entity);
}

std::optional<std::string> createNetworkGlobalEntityKey(std::string_view domain,
                                                        std::string_view entity) {
  if (script().failing == scripted::Step::kKey) return std::nullopt;
  return std::string(domain) + "global:" + std::string(entity);
}

std::optional<Dictionary> copyMultiple(const DynamicStoreRef& store,
                                       const std::vector<std::string>& keys,
                                       const std::vector<std::string>& patterns) {
  script().log.push_back("copy keys" + listed(keys) + " patterns" + listed(patterns));
  if (!store || script().failing == scripted::Step::kCopy) return std::nullopt;
  return script().contents;
}

bool setNotificationKeys(const DynamicStoreRef& store, const std::vector<std::string>& keys,
                         const std::vector<std::string>& patterns) {
  script().log.push_back("notify keys" + listed(keys) + " patterns" + listed(patterns));
  return store != nullptr;
}

DynamicStoreSourceRef createRunLoopSource(const DynamicStoreRef& store, int order) {
  script().log.push_back("source of order " + std::to_string(order));
  return store ? std::make_shared<DynamicStoreSource>() : nullptr;
}

void addSourceToMainLoop(const DynamicStoreSourceRef& source) {
  script().log.emplace_back(source ? "add source" : "add null source");
}

int lastDynamicStoreError() {
  return script().error;
}

}  // namespace onramp

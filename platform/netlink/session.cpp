#include "platform/netlink/session.h"

#include <algorithm>
#include <iterator>
#include <utility>

#include "platform/netlink/ipv4_state.h"

namespace onramp {

namespace netlink {

// Returns null when the pattern is invalid.
Selection::Pattern Selection::compile(const std::string& pattern) {
  auto compiled = std::make_unique<regex_t>();
  const std::string whole = "^(" + pattern + ")$";
  if (::regcomp(compiled.get(), whole.c_str(), REG_EXTENDED | REG_NOSUB) != 0) return nullptr;
  return Pattern(compiled.release());
}

std::optional<Selection> Selection::of(const std::vector<std::string>& keys,
                                       const std::vector<std::string>& patterns) {
  Selection selection;
  selection.keys_ = keys;
  for (const std::string& pattern : patterns) {
    selection.patterns_.push_back(compile(pattern));
    if (!selection.patterns_.back()) return std::nullopt;
  }
  return selection;
}

bool Selection::has(const std::string& key) const {
  return std::find(keys_.begin(), keys_.end(), key) != keys_.end() ||
         std::any_of(patterns_.begin(), patterns_.end(), [&](const Pattern& pattern) {
           return ::regexec(pattern.get(), key.c_str(), 0, nullptr, 0) == 0;
         });
}

bool Selection::hasGlobal() const {
  return has(*createNetworkGlobalEntityKey(kSCDynamicStoreDomainState, kSCEntNetIPv4));
}

std::optional<Dictionary> Selection::read(nl_sock* socket) const {
  const std::optional<Dictionary> state = readIPv4State(socket, hasGlobal());
  if (!state) return std::nullopt;
  std::vector<Dictionary::Pair> selected;
  std::copy_if(state->begin(), state->end(), std::back_inserter(selected),
               [&](const Dictionary::Pair& pair) { return has(pair.key); });
  return Dictionary(std::move(selected));
}

}  // namespace netlink

void DynamicStore::tellChanges() {
  const std::optional<Dictionary> now = notified.read(socket.get());
  if (!now) return;
  const Dictionary before = std::exchange(known, *now);
  std::vector<std::string> changed;
  for (const auto& [key, value] : before) {
    const Value* present = now->find(key);
    if (!present || *present != value) changed.push_back(key);
  }
  for (const auto& [key, value] : *now) {
    if (!before.find(key)) changed.push_back(key);
  }
  if (!changed.empty() && callback) callback(changed);
}

bool DynamicStore::startWatch() {
  if (!watch || !changesArrived || watch->start(changesArrived)) return true;
  watch.reset();
  return false;
}

}  // namespace onramp

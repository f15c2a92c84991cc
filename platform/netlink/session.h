#pragma once

#include <regex.h>

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "platform/dynamic_store.h"
#include "platform/netlink/change_watch.h"
#include "platform/netlink/handles.h"

namespace onramp {

namespace netlink {

/// The keys that a request to the store means.
class Selection {
 public:
  /// No keys at all.
  Selection() = default;

  /// By platform/dynamic_store.h's rules; nothing when a pattern cannot be read.
  [[nodiscard]] static std::optional<Selection> of(const std::vector<std::string>& keys,
                                                   const std::vector<std::string>& patterns);

  [[nodiscard]] bool has(const std::string& key) const;

  /// Whether the global IPv4 entity is among the keys.
  [[nodiscard]] bool hasGlobal() const;

  /// The entries of the system's present state that are meant; nothing when the kernel cannot be
  /// asked.
  [[nodiscard]] std::optional<Dictionary> read(nl_sock* socket) const;

 private:
  struct FreePattern {
    void operator()(regex_t* pattern) const {
      ::regfree(pattern);
      std::default_delete<regex_t>()(pattern);
    }
  };
  using Pattern = std::unique_ptr<regex_t, FreePattern>;

  [[nodiscard]] static Pattern compile(const std::string& pattern);

  std::vector<std::string> keys_;
  std::vector<Pattern> patterns_;
};

}  // namespace netlink

struct DynamicStore {
  netlink::Socket socket;
  DynamicStoreCallback callback;
  netlink::Selection notified;
  Dictionary known;  ///< the entries of `notified` as the callback was last told of them
  std::function<void()> changesArrived;  ///< from the session's source, once that is on the loop
  std::unique_ptr<netlink::ChangeWatch> watch;  ///< from the first setNotificationKeys on

  /// Tells the callback which notified entries differ from those it knows, if any.
  void tellChanges();

  /// Lets the watch call `changesArrived`, when there are both.
  void startWatch() const;
};

struct DynamicStoreSource {
  explicit DynamicStoreSource(DynamicStoreRef session) : store(std::move(session)) {}

  DynamicStoreRef store;
};

}  // namespace onramp

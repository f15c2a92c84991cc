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

/// The keys that a request to the store selects.
class Selection {
 public:
  /// Creates an empty selection.
  Selection() = default;

  /// Creates the selection that copyMultiple() in platform/dynamic_store.h describes. Returns
  /// nothing when a pattern is invalid.
  [[nodiscard]] static std::optional<Selection> of(const std::vector<std::string>& keys,
                                                   const std::vector<std::string>& patterns);

  /// Returns whether `key` is selected.
  [[nodiscard]] bool has(const std::string& key) const;

  /// Returns whether the global IPv4 entity is selected.
  [[nodiscard]] bool hasGlobal() const;

  /// Returns the selected entries of the system's current state, or nothing when the state cannot
  /// be read.
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
  Dictionary known;                      ///< the entries that `notified` selects, as last read
  std::function<void()> changesArrived;  ///< empty until addSourceToMainLoop()
  /// Null before setNotificationKeys(), and after startWatch() has failed.
  std::unique_ptr<netlink::ChangeWatch> watch;

  /// Calls `callback` with the keys in `notified` whose values have changed, if there are any.
  void tellChanges();

  /// If `watch` and `changesArrived` are set, makes `watch` call `changesArrived`. Destroys `watch`
  /// and returns false when the thread cannot be created.
  bool startWatch();
};

struct DynamicStoreSource {
  explicit DynamicStoreSource(DynamicStoreRef session) : store(std::move(session)) {}

  DynamicStoreRef store;
};

}  // namespace onramp

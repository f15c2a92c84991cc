// addSourceToMainLoop() is in a separate file, so that a program without a run loop can link the
// other functions of the store.

#include <atomic>
#include <memory>
#include <vector>

#include "platform/netlink/session.h"
#include "platform/run_loop.h"

namespace onramp {

void addSourceToMainLoop(const DynamicStoreSourceRef& source) {
  if (!source || source->store->changesArrived) return;
  const DynamicStoreRef& store = source->store;

  static std::vector<DynamicStoreSourceRef> sourcesOnLoop;
  sourcesOnLoop.push_back(source);

  // Makes the main thread check for changes. If the kernel reports more changes before the main
  // thread does so, a single check covers all of them.
  const auto posted = std::make_shared<std::atomic<bool>>(false);
  store->changesArrived = [posted, weak = std::weak_ptr(store)] {
    if (posted->exchange(true)) return;
    performOnMainThread([posted, weak] {
      *posted = false;
      if (const DynamicStoreRef live = weak.lock()) live->tellChanges();
    });
  };
  store->startWatch();
}

}  // namespace onramp

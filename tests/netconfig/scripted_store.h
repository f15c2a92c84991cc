#pragma once

#include <string>
#include <vector>

#include "platform/dynamic_store.h"

namespace onramp::scripted {

enum class Step { kNone, kCreate, kKey, kCopy };

/// A store that holds and does what a test says, and remembers how it was called.
struct Store {
  static Store& instance();

  Dictionary contents;
  Step failing = Step::kNone;
  int error = 0;  ///< what lastDynamicStoreError reports
  std::vector<std::string> log;
  DynamicStoreCallback callback;  ///< of the session that was last created with one

  /// The contents become `contents`, and the installed callback hears of it.
  void change(Dictionary contents);
};

}  // namespace onramp::scripted

#include "tools/devices/questions.h"

#include <utility>

#include "platform/run_loop.h"

namespace onramp::devices {

Questions::~Questions() {
  stop();
}

void Questions::ask(const Array& addresses, Answered answered) {
  ++*pending_;
  const auto operation = [addresses, answered = std::move(answered), stopped = stopped_,
                          pending = pending_] {
    Answer answer = askDevice(addresses, *stopped);
    performOnMainThread([answer = std::move(answer), answered, pending] {
      --*pending;
      answered(answer);
    });
  };
  // If the system cannot start another thread, the caller's thread asks the device.
  if (!queue_.addOperation(operation)) operation();
}

}  // namespace onramp::devices

#include "platform/failed_writes.h"

#include <signal.h>

#include <initializer_list>

namespace onramp {

void surviveFailedWrites() {
  for (const int signalNumber : {SIGPIPE, SIGXFSZ}) {
    struct sigaction action {};
    action.sa_handler = SIG_IGN;
    sigaction(signalNumber, &action, nullptr);
  }
}

}  // namespace onramp

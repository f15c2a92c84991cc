#pragma once

namespace onramp {

/// Makes failed writes return an error instead of killing the process with SIGPIPE (a pipe has no
/// reader) or SIGXFSZ (a file would exceed the limit on file sizes). Call this once, before the
/// first write.
void surviveFailedWrites();

}  // namespace onramp

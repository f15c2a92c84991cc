#pragma once

namespace onramp {

/// Makes a write return an error, instead of ending the process, when the reader of a pipe has gone
/// away or when a file would exceed the limit on file sizes. Call this once, before anything is
/// written.
void surviveFailedWrites();

}  // namespace onramp

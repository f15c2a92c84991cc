#pragma once

namespace onramp {

/// Makes a write fail, instead of ending the process, when its reader is gone or the file would
/// exceed the user's limit on file sizes. Call it once, before anything is written.
void surviveFailedWrites();

}  // namespace onramp

#pragma once

namespace onramp::qt {

/// Makes assistive programs see headings and groups of radio buttons as such. Call it once, before
/// the first interface file is loaded.
void describeControls();

}  // namespace onramp::qt

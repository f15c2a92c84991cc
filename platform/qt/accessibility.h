#pragma once

namespace onramp::qt {

/// Lets assistive technology recognise headings and groups of radio buttons. Call this once, before
/// the first interface file is loaded.
void describeControls();

}  // namespace onramp::qt

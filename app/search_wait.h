#pragma once

#include <chrono>

namespace onramp {

// How long the wizard waits for the device search. A wait is a series of pauses. It ends after a
// pause if a device is listed by then.

/// The number of pauses after which the wait ends even if no device is listed.
inline constexpr int kMostPauses = 5;

/// The length of each pause after the user clicks Next on the connection page.
inline constexpr std::chrono::seconds kFirstSearchPause{2};

/// The length of each pause when the wizard starts a search on the chooser, the page that lists the
/// devices. When the user starts a search there, ChooseDeviceView::kRefreshPause applies instead.
inline constexpr std::chrono::seconds kChooserSearchPause{3};

}  // namespace onramp

#pragma once

#include <chrono>

namespace onramp {

// How long the wizard waits for the device search. A wait is a series of pauses. It ends early if a
// device is listed at the end of a pause.

/// The maximum number of pauses in a wait.
inline constexpr int kMostPauses = 5;

/// The length of each pause after the user clicks Next on the connection page.
inline constexpr std::chrono::seconds kFirstSearchPause{2};

/// The length of each pause when the wizard starts a search on the chooser, the page that lists the
/// devices. When the user starts a search there, ChooseDeviceView::kRefreshPause applies instead.
inline constexpr std::chrono::seconds kChooserSearchPause{3};

}  // namespace onramp

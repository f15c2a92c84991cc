#pragma once

#include <chrono>

namespace onramp {

// How long the wizard waits for the device search. A wait consists of pauses. After each pause, the
// wizard checks whether a device is listed, and ends the wait if one is.

/// The number of pauses in a wait that finds no device.
inline constexpr int kMostPauses = 5;

/// The length of each pause when the user has clicked Next on the connection page.
inline constexpr std::chrono::seconds kFirstSearchPause{2};

/// The length of each pause when the wizard searches from the chooser, the page that lists the
/// devices. A refresh that the user requests has pauses of ChooseDeviceView::kRefreshPause instead.
inline constexpr std::chrono::seconds kChooserSearchPause{3};

}  // namespace onramp

#pragma once

#include <chrono>

namespace onramp {

// How long the wizard waits for the device search. A wait consists of pauses, after each of which
// the wizard checks whether a device is listed.

/// The number of pauses in a wait that finds no device. A wait ends early once a device is listed.
inline constexpr int kMostPauses = 5;

/// The length of each pause when the user has clicked Next on the connection page.
inline constexpr std::chrono::seconds kFirstSearchPause{2};

/// The length of each pause when the wizard searches from the chooser, the page that lists the
/// devices. A refresh that the user requests has pauses of ChooseDeviceView::kRefreshPause instead.
inline constexpr std::chrono::seconds kChooserSearchPause{3};

}  // namespace onramp

#pragma once

#include <chrono>

namespace onramp {

// How long the wizard waits for the device search.

/// The number of pauses in a wait that finds no device. A wait ends early if a device is listed at
/// the end of a pause.
inline constexpr int kMostPauses = 5;

/// The length of each pause when the user has clicked Next on the connection page.
inline constexpr std::chrono::seconds kFirstSearchPause{2};

/// The length of each pause when the wizard searches from the chooser. A refresh that the user
/// requests has pauses of ChooseDeviceView::kRefreshPause instead.
inline constexpr std::chrono::seconds kChooserSearchPause{3};

}  // namespace onramp

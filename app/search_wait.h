#pragma once

#include <chrono>

namespace onramp {

// How long the wizard waits for the device search.

/// The number of pauses in a wait that finds nothing. A wait ends early after any pause that finds
/// a device listed.
inline constexpr int kMostPauses = 5;

/// Length of a pause after Next on the connection page.
inline constexpr std::chrono::seconds kFirstSearchPause{2};

/// Length of a pause in a search from the chooser. A refresh carries its own pause, which is
/// ChooseDeviceView::kRefreshPause.
inline constexpr std::chrono::seconds kChooserSearchPause{3};

}  // namespace onramp

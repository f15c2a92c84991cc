#pragma once

#include <string>
#include <vector>

#include "tools/devices/verdict.h"

namespace onramp::devices {

/// The delay that a device causes in the wizard by answering slowly or not at all. All members are
/// 0 if the delay is shorter than a second.
struct Delay {
  double seconds = 0;       ///< how long the wizard's window does not respond
  std::size_t delayed = 0;  ///< how many listed devices appear later because of this delay
  std::size_t hidden = 0;   ///< how many of these devices the wizard's search misses
};

/// A device, and the verdict on it.
struct JudgedDevice {
  const Device* device = nullptr;  ///< not owned
  Verdict verdict{};
  std::vector<Verdict> notes{};
  Delay delay{};
};

/// The result of a search.
struct BrowseResult {
  const Medium* medium = nullptr;  ///< not owned
  double seconds = 0;              ///< how long the search took
  bool isInterrupted = false;
  std::vector<JudgedDevice> devices{};  ///< in the order in which they were found
  std::vector<Verdict> network{};       ///< problems of the network as a whole
};

/// Returns whether `device` has the note "missed": it passes every check, but the wizard's first
/// search misses it.
[[nodiscard]] bool isMissed(const JudgedDevice& device);

/// Sets the delay that each device would cause in the wizard's first search, and adds the note
/// "missed" to the devices that the search misses because of a delay. The wizard asks one device
/// after another, in the order in which they are resolved.
void computeDelays(std::vector<JudgedDevice>& devices);

/// Returns the result as JSON, in the form that the manual page describes.
[[nodiscard]] std::string jsonOf(const BrowseResult& result);

}  // namespace onramp::devices

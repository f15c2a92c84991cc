#pragma once

#include <string>
#include <vector>

#include "tools/devices/verdict.h"

namespace onramp::devices {

/// How a device that answers slowly, or not at all, affects the devices that the wizard asks after
/// it.
struct Delay {
  double seconds = 0;       ///< how long the wizard's window stands still
  std::size_t delayed = 0;  ///< how many listed devices appear later
  std::size_t hidden = 0;   ///< how many of those the wizard's search misses
};

struct JudgedDevice {
  const Device* device = nullptr;  ///< not owned
  Verdict verdict{};
  std::vector<Verdict> notes{};
  Delay delay{};
};

struct BrowseResult {
  const Medium* medium = nullptr;  ///< not owned
  double seconds = 0;
  bool isInterrupted = false;
  std::vector<JudgedDevice> devices{};  ///< in the order in which they were found
  std::vector<Verdict> network{};       ///< what is wrong with the network as a whole
};

/// Fills in the delays. The calculation is for the wizard's first search, in which it asks the
/// devices one by one, in the order in which they were resolved.
void computeDelays(std::vector<JudgedDevice>& devices);

/// Returns the result as JSON, in the form that the manual page describes.
[[nodiscard]] std::string jsonOf(const BrowseResult& result);

}  // namespace onramp::devices

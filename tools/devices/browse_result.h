#pragma once

#include <string>
#include <vector>

#include "tools/devices/verdict.h"

namespace onramp::devices {

/// What one device that keeps the wizard waiting does to those that are asked after it.
struct Delay {
  double seconds = 0;       ///< that the wizard's window stands still
  std::size_t delayed = 0;  ///< devices of the list that come later because of it
  std::size_t hidden = 0;   ///< those of them that come too late for the wizard's search
};

struct JudgedDevice {
  const Device* device = nullptr;
  Verdict verdict{};
  std::vector<Verdict> notes{};
  Delay delay{};
};

struct BrowseResult {
  const Medium* medium = nullptr;
  double seconds = 0;
  bool isInterrupted = false;
  std::vector<JudgedDevice> devices{};  ///< in the order in which they were found
  std::vector<Verdict> network{};       ///< what is wrong with the whole
};

/// Fills in the delays: the wizard asks in the order in which devices are resolved, one after the
/// other, and ends its search after `searchSeconds`.
void computeDelays(std::vector<JudgedDevice>& devices, double searchSeconds);

/// The result as JSON, in the form that the manual page describes.
[[nodiscard]] std::string jsonOf(const BrowseResult& result);

}  // namespace onramp::devices

#include "tools/devices/browse_result.h"

#include <algorithm>

namespace onramp::devices {

namespace {

constexpr double kNoticeable = 1;  // seconds

}  // namespace

void computeDelays(std::vector<JudgedDevice>& devices, double searchSeconds) {
  std::vector<JudgedDevice*> asked;
  for (JudgedDevice& one : devices) {
    if (one.device->answer) asked.push_back(&one);
  }
  std::sort(asked.begin(), asked.end(), [](const auto* a, const auto* b) {
    return a->device->resolved.value_or(0) < b->device->resolved.value_or(0);
  });
  double clock = 0;
  for (std::size_t i = 0; i < asked.size(); ++i) {
    const double cost = asked[i]->device->answer->seconds;
    clock = std::max(clock, asked[i]->device->resolved.value_or(0)) + cost;
    if (cost < kNoticeable) continue;
    asked[i]->delay.seconds = cost;
    for (std::size_t later = i + 1; later < asked.size(); ++later) {
      if (!asked[later]->verdict.isListed) continue;
      ++asked[i]->delay.delayed;
      if (clock >= searchSeconds) ++asked[i]->delay.hidden;
    }
  }
}

}  // namespace onramp::devices

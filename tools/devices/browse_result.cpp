#include "tools/devices/browse_result.h"

#include <algorithm>
#include <chrono>
#include <cmath>

#include "app/search_wait.h"
#include "tools/devices/text.h"

namespace onramp::devices {

namespace {

constexpr double kNoticeable = 1;  // seconds
constexpr double kPause = std::chrono::duration<double>(kFirstSearchPause).count();

}  // namespace

bool isMissed(const JudgedDevice& device) {
  return std::any_of(device.notes.begin(), device.notes.end(),
                     [](const Verdict& note) { return note.id == "missed"; });
}

void computeDelays(std::vector<JudgedDevice>& devices) {
  std::vector<JudgedDevice*> asked;
  for (JudgedDevice& one : devices) {
    if (one.device->answer) asked.push_back(&one);
  }
  std::sort(asked.begin(), asked.end(), [](const auto* a, const auto* b) {
    return a->device->resolved.value_or(0) < b->device->resolved.value_or(0);
  });
  double clock = 0;
  double end = kMostPauses * kPause;
  for (std::size_t i = 0; i < asked.size(); ++i) {
    const double cost = asked[i]->device->answer->seconds;
    clock = std::max(clock, asked[i]->device->resolved.value_or(0)) + cost;
    // The wizard's search lasts a whole number of pauses. It ends after the first pause in which a
    // device is listed.
    if (asked[i]->verdict.isListed) end = std::min(end, std::ceil(clock / kPause) * kPause);
    if (cost < kNoticeable) continue;
    asked[i]->delay.seconds = cost;
    for (std::size_t later = i + 1; later < asked.size(); ++later) {
      if (!asked[later]->verdict.isListed) continue;
      ++asked[i]->delay.delayed;
      if (clock < end) continue;
      ++asked[i]->delay.hidden;
      if (isMissed(*asked[later])) continue;
      asked[later]->notes.push_back(
          {.id = "missed",
           .why = "the wizard's first search ends before the wizard asks this device, because it "
                  "waits for " +
                  inQuotes(asked[i]->device->name),
           .remedy = "correct or switch off " + inQuotes(asked[i]->device->name)});
    }
  }
}

}  // namespace onramp::devices

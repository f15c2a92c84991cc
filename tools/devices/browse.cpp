#include <algorithm>
#include <chrono>
#include <cstdint>
#include <map>
#include <memory>
#include <set>

#include "bonjour/KSDevice.h"
#include "bonjour/identity_keys.h"
#include "netconfig/local_address_cache.h"
#include "platform/interruption.h"
#include "platform/main_loop.h"
#include "platform/run_loop.h"
#include "tools/devices/browse_result.h"
#include "tools/devices/browse_text.h"
#include "tools/devices/commands.h"
#include "tools/devices/finder.h"
#include "tools/devices/medium.h"
#include "tools/devices/network.h"
#include "tools/devices/progress.h"
#include "tools/devices/questions.h"

namespace onramp::devices {

namespace {

constexpr std::chrono::milliseconds kProgressPause{250};

std::vector<std::string> typesToBrowse(const Medium& medium) {
  std::vector<std::string> types{medium.type};
  for (const std::string_view type : kIdentifyingTypes) {
    if (type != medium.type) types.emplace_back(type);
  }
  return types;
}

class Session {
 public:
  Session(const BrowseOptions& options, Medium medium)
      : options_(options),
        medium_(std::move(medium)),
        style_(outputStyle(options.verbose)),
        finder_(std::make_shared<Finder>(medium_.type, [this](Device& d) { changed(d); })) {}

  int run();

 private:
  void changed(Device& device);
  void ask(Device& device);
  void show(const Device& device);
  void showProgress();
  void stopListening();
  void finishIfDone();
  [[nodiscard]] JudgedDevice judged(const Device& device) const;
  [[nodiscard]] BrowseResult result();

  const BrowseOptions options_;
  const Medium medium_;
  const TextStyle style_;
  std::shared_ptr<Finder> finder_;
  Questions questions_;
  Progress progress_;
  std::set<const Device*> shown_;
  std::map<const Device*, Dictionary> asked_;
  bool isListening_ = true;
  bool isInterrupted_ = false;
};

JudgedDevice Session::judged(const Device& device) const {
  return {.device = &device,
          .verdict = judge(device, medium_, isInLocalSubnet),
          .notes = notesOn(device, medium_)};
}

void Session::changed(Device& device) {
  if (!isListening_) return;
  if (device.gone) {
    if (!options_.json) progress_.print(goneRow(device, style_));
    shown_.erase(&device);
  } else if (isAsked(device, medium_)) {
    ask(device);
  } else if (device.resolved && device.type == medium_.type) {
    show(device);
  }
}

// Asks a device, but not again while its record is unchanged. The wizard does the same.
void Session::ask(Device& device) {
  Dictionary& asked = asked_[&device];
  if (asked == device.record) return;
  asked = device.record;
  const Array* const addresses = device.record.array(KSDevice::kIPAddressList);
  questions_.ask(addresses ? *addresses : Array(), [this, &device](Answer answer) {
    device.answer = std::move(answer);
    shown_.erase(&device);
    show(device);
    finishIfDone();
  });
}

void Session::show(const Device& device) {
  if (options_.json || !shown_.insert(&device).second) return;
  progress_.print(rowOf(judged(device), style_));
}

void Session::showProgress() {
  const auto devices = finder_->devices();
  const auto resolved = std::count_if(devices.begin(), devices.end(),
                                      [](const Device* d) { return d->resolved.has_value(); });
  progress_.show(std::to_string(static_cast<int>(finder_->now())) +
                 " s: " + std::to_string(devices.size()) + " found, " + std::to_string(resolved) +
                 " resolved, " + std::to_string(questions_.pending()) + " being asked");
  scheduleTimer(kProgressPause, [this] { showProgress(); });
}

void Session::stopListening() {
  isListening_ = false;
  finishIfDone();
}

void Session::finishIfDone() {
  if (isInterrupted_ || (!isListening_ && questions_.pending() == 0)) endMainLoop();
}

BrowseResult Session::result() {
  BrowseResult result{
      .medium = &medium_, .seconds = finder_->now(), .isInterrupted = isInterrupted_};
  for (const Device* device : finder_->devices())
    result.devices.push_back(judged(*device));
  std::stable_sort(result.devices.begin(), result.devices.end(),
                   [](const auto& a, const auto& b) { return a.device->found < b.device->found; });
  computeDelays(result.devices);
  result.network = networkProblems(!result.devices.empty(), result.seconds);
  return result;
}

int Session::run() {
  onInterruption([this] {
    isInterrupted_ = true;
    finishIfDone();
  });
  AddNetworkInterfaceListChangeCallbackSCF();
  if (!options_.json) progress_.print(tableHead(medium_, style_));
  finder_->start(typesToBrowse(medium_), options_.allTypes);
  scheduleTimer(std::chrono::milliseconds(static_cast<std::int64_t>(options_.seconds * 1000)),
                [this] { stopListening(); });
  if (Progress::isShown()) showProgress();
  runMainLoop();
  isListening_ = false;
  finder_->stop();
  questions_.stop();

  const BrowseResult all = result();
  const int status = all.network.empty() || !all.devices.empty() ? 0 : kNothingFound;
  if (options_.json) {
    progress_.print(jsonOf(all));
    return status;
  }
  // Shows the verdict on each device that has no row yet, and on each device that is gone.
  for (const JudgedDevice& one : all.devices)
    show(*one.device);
  progress_.print(summaryOf(all, style_));
  return status;
}

}  // namespace

int browse(const BrowseOptions& options) {
  auto medium = readMedium(options.medium, options.models);
  if (!medium) return kTrouble;
  Session session(options, std::move(*medium));
  return session.run();
}

}  // namespace onramp::devices

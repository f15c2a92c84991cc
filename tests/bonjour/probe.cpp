// Searches for services or looks up addresses, and prints a line for each event: the seconds since
// the start, a word for the event, and details. A search stops at the end of standard input. Tests
// and benchmarks run this program on a practice network.
//
//   bonjour_probe search TYPE            searches for services of TYPE with KSBonjourSearch
//   bonjour_probe addresses URI SECONDS  looks up the addresses of the device with that URI

#include <unistd.h>

#include <chrono>
#include <cstdio>
#include <string>
#include <thread>

#include "bonjour/KSBonjourSearch.h"
#include "bonjour/KSDevice.h"
#include "bonjour/KSNetService.h"
#include "platform/run_loop.h"
#include "tests/recording/loop.h"
#include "tests/recording/medium_folder.h"

namespace onramp {

namespace {

using Clock = std::chrono::steady_clock;

const Clock::time_point start = Clock::now();

void print(const char* what, const std::string& details) {
  const std::chrono::duration<double> since = Clock::now() - start;
  std::printf("%.6f\t%s\t%s\n", since.count(), what, details.c_str());
  std::fflush(stdout);
}

std::string joined(const std::vector<std::string>& texts) {
  std::string all;
  for (const std::string& text : texts)
    all += (all.empty() ? "" : ",") + text;
  return all;
}

std::string describe(const Dictionary& device) {
  std::string text;
  for (const auto key :
       {KSDevice::kDisplayName, KSDevice::kModelName, KSDevice::kLocation, KSDevice::kDeviceURI}) {
    text += device.string(key).value_or("?") + '\t';
  }
  std::vector<std::string> addresses;
  for (const Value& address : *device.array(KSDevice::kIPAddressList))
    addresses.push_back(*address.as<std::string>());
  return text + joined(addresses);
}

class Printer final : public KSDeviceObserver {
 public:
  void addKSDevice(const Dictionary& device) override { print("add", describe(device)); }
  void updateKSDevice(const Dictionary& device) override { print("update", describe(device)); }
  void removeKSDevice(const Dictionary& device) override { print("remove", describe(device)); }
};

void printNotifications() {
  static const int observer = 0;
  for (const auto& [name, word] :
       {std::pair{kAddNotification, "found"}, std::pair{kRemoveNotification, "gone"}}) {
    NotificationCenter::defaultCenter().addObserver(&observer, name, [word = word](const auto& n) {
      const auto service = std::any_cast<NetServiceRef>(n.userInfo.find(kServiceInfo)->second);
      print(word, service->name().value_or("?"));
    });
  }
}

void runUntilInputEnds() {
  bool ended = false;
  std::thread waiter([&ended] {
    char byte = 0;
    while (read(STDIN_FILENO, &byte, 1) > 0) {
    }
    performOnMainThread([&ended] { ended = true; });
  });
  recording::runPosted([&ended] { return ended; }, std::chrono::hours(1));
  waiter.join();
}

int search(const std::string& type) {
  const recording::MediumFolder medium;
  medium.describe({{"BonjourNetwork", type}}, {}, {});
  const auto printer = std::make_shared<Printer>();
  const auto bonjour = KSBonjourSearch::init();
  bonjour->addKSDeviceObserver(printer);
  printNotifications();
  print("start", type);
  bonjour->startBrowsing();
  runUntilInputEnds();
  bonjour->stopBrowsing();
  return 0;
}

int addresses(const std::string& uri, double timeout) {
  std::optional<std::vector<std::string>> list;
  const int status = KSNetServiceCopyAddressesForDeviceURI(uri, &list, timeout);
  print(status == 0 ? "addresses" : "failed", joined(list.value_or(std::vector<std::string>())));
  return status;
}

}  // namespace
}  // namespace onramp

int main(int count, char** words) {
  const std::vector<std::string> arguments(words + 1, words + count);
  if (arguments.size() == 2) return onramp::search(arguments[1]);
  if (arguments.size() == 3) return onramp::addresses(arguments[1], std::stod(arguments[2]));
  return 2;
}

// Runs a search or a look-up on the real network and prints its events, one on each line: the
// seconds since the start, the event and its details. Tests and benchmarks run this program on a
// practice network. A search ends when the standard input is closed.
//
//   bonjour_probe search TYPE            searches for services of TYPE with KSBonjourSearch
//   bonjour_probe addresses URI SECONDS  looks up the addresses of the device that URI names

#include <sys/resource.h>
#include <unistd.h>

#include <chrono>
#include <cstdio>
#include <string>
#include <thread>

#include "bonjour/KSBonjourSearch.h"
#include "bonjour/KSDevice.h"
#include "bonjour/KSNetService.h"
#include "platform/bundle.h"
#include "platform/property_list.h"
#include "platform/run_loop.h"
#include "platform/system_version.h"
#include "tests/recording/loop.h"

namespace onramp {

namespace {

using Clock = std::chrono::steady_clock;

const Clock::time_point start = Clock::now();
std::string browsedType;

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

  rusage usage{};
  getrusage(RUSAGE_SELF, &usage);
  const auto seconds = [](const timeval& time) {
    return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_usec) / 1e6;
  };
  print("cpu", std::to_string(seconds(usage.ru_utime) + seconds(usage.ru_stime)));
}

int search(const std::string& type) {
  browsedType = type;
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

int run(const std::vector<std::string>& arguments) {
  if (arguments.size() == 2 && arguments[0] == "search") return search(arguments[1]);
  if (arguments.size() == 3 && arguments[0] == "addresses") {
    return addresses(arguments[1], std::stod(arguments[2]));
  }
  std::fputs("usage: bonjour_probe search TYPE | addresses URI SECONDS\n", stderr);
  return 2;
}

}  // namespace

// Stand-ins for the medium and the system version, which a search reads.

Bundle Bundle::main() {
  return Bundle("/medium/Onramp OSX.app");
}

std::optional<std::string> Bundle::infoString(std::string_view) const {
  return "resources";
}

std::optional<Dictionary> loadDictionary(const std::string&) {
  return Dictionary{{"CDInfo", "description"}, {"BonjourNetwork", browsedType}};
}

std::optional<std::int32_t> gestaltSystemVersion() {
  return 0x1095;
}

}  // namespace onramp

int main(int count, char** arguments) {
  return onramp::run({arguments + 1, arguments + count});
}

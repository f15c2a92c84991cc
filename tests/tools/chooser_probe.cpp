// Runs the wizard's own device chooser for SECONDS seconds, and lets it search for the models
// MODEL…. Then prints the names of the devices in the chooser's list, one per line. APPLICATION is
// the path of the wizard's application on the medium.
//
//   chooser_probe APPLICATION SECONDS MODEL…

#include <chrono>
#include <cstdio>
#include <string>
#include <vector>

#include "app/OnrampOSXAppDelegate.h"
#include "pages/ChooseDeviceView.h"
#include "platform/freedesktop/main_bundle.h"
#include "tests/recording/front_end.h"
#include "tests/recording/loop.h"

int main(int count, char** arguments) {
  using namespace onramp;
  const std::vector<std::string> words(arguments + 1, arguments + count);
  if (words.size() < 3) return 2;
  setMainBundlePath(words[0]);
  OnrampOSXAppDelegate delegate;
  const auto page =
      std::dynamic_pointer_cast<ChooseDeviceView>(delegate.loadView("ChooseDeviceView"));
  if (!page) return 1;
  page->setSearchModelList({words.begin() + 2, words.end()});
  page->startBrowsing();
  recording::runPosted([] { return false; }, std::chrono::duration<double>(std::stod(words[1])));
  page->stopBrowsing();
  const auto& table = recording::FrontEnd::instance().object("deviceListView");
  for (const Dictionary& entry : table.content->arrangedObjects())
    std::puts(entry.string(ChooseDeviceView::kDevice).value_or("").c_str());
  return 0;
}

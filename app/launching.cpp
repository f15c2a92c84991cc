#include <chrono>
#include <filesystem>
#include <system_error>

#include "app/OnrampOSXAppDelegate.h"
#include "base/ascii.h"
#include "base/maker.h"
#include "base/text.h"
#include "media/KSOROSXCD.h"
#include "platform/bundle.h"
#include "platform/child_process.h"
#include "platform/property_list.h"
#include "platform/run_loop.h"
#include "platform/user_locale.h"
#include "platform/workspace.h"

namespace onramp {

namespace {

// The time between opening the package and terminating the application.
constexpr std::chrono::milliseconds kQuitDelay{1000};

// The time between hiding the application and running the set-up tool. The main thread is blocked
// while the tool runs, so the window must disappear first.
constexpr std::chrono::milliseconds kHideBeforeToolDelay{500};

// Exit statuses of the set-up tool. After any other status, and when there is none, the wizard
// searches again.
constexpr int kToolAsksToGoBack = 1;
constexpr int kToolAsksToQuit = 2;

std::optional<int> runSetUpTool(const std::optional<FileURL>& tool) {
  const auto bundle = tool ? Bundle::open(tool->path) : std::nullopt;
  const auto executable = bundle ? bundle->executablePath() : std::nullopt;
  std::error_code ignored;
  if (!executable || !std::filesystem::is_regular_file(*executable, ignored)) return std::nullopt;
  return runAndWait(*executable, {"-installer"});
}

}  // namespace

bool OnrampOSXAppDelegate::launchPackage() {
  copyCDInfo();
  const std::optional<FileURL>& package = mKSInstallerInfo.pkgURL();
  return package && openFile(package->path);
}

void OnrampOSXAppDelegate::handOverAndQuit(const std::optional<Dictionary>& modelFile) {
  if (modelFile) writeDictionaryAtomically(*modelFile, instmodelPlistURL());
  launchPackage();
  quitMe();
}

void OnrampOSXAppDelegate::quitMe() {
  scheduleTimer(kQuitDelay, [this] { performTimerQuitMe(); });
}

void OnrampOSXAppDelegate::performTimerQuitMe() {
  terminateApplication();
}

void OnrampOSXAppDelegate::launchWLANToolAutomatically() {
  launchWLANTool(ToolStart::kAutomatic);
}

void OnrampOSXAppDelegate::launchWLANToolManually() {
  launchWLANTool(ToolStart::kManual);
}

void OnrampOSXAppDelegate::launchWLANTool(ToolStart start) {
  hideApplication();
  scheduleTimer(kHideBeforeToolDelay, [this, start] { performLaunchWLANTool(start); });
}

void OnrampOSXAppDelegate::performLaunchWLANTool(ToolStart start) {
  const std::optional<int> status = runSetUpTool(mKSInstallerInfo.WLANtoolURL());
  if (status == kToolAsksToQuit) {
    terminateApplication();
    return;
  }
  if (status == kToolAsksToGoBack) {
    if (start == ToolStart::kAutomatic) {
      mIsWLANTool = false;
      backToConnectionType();
      if (auto* const page = shownPage<ConnectionTypeView>()) {
        page->setChooseButton(ConnectionTypeView::kWirelessRow, 0);
      }
    }
  } else {
    setChooseDeviceViewButton();
    showChooseDeviceView();
  }
  unhideApplication();
  activateIgnoringOtherApps();
  window.makeKeyAndOrderFront();
}

std::optional<std::string> OnrampOSXAppDelegate::FAQ_URL() {
  const std::string series =
      KSOROSXCD::initWithCDInfo().string(KSOROSXCD::kKSCSeriesCode).value_or("");
  const std::string path = "/g/d/c2f2/" + series + "/" + localeLanguageCode() + "/" +
                           asciiLowercased(localeCountryCode()) + "/";
  return isURLText(path) ? std::optional(std::string(maker::kSupportSite) + path) : std::nullopt;
}

void OnrampOSXAppDelegate::openURL(const std::optional<std::string>& url) {
  if (url) onramp::openURL(*url);
}

}  // namespace onramp

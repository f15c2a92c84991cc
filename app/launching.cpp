#include <algorithm>
#include <filesystem>
#include <system_error>

#include "app/OnrampOSXAppDelegate.h"
#include "base/ascii.h"
#include "media/KSOROSXCD.h"
#include "platform/bundle.h"
#include "platform/child_process.h"
#include "platform/run_loop.h"
#include "platform/user_locale.h"
#include "platform/workspace.h"

namespace onramp {

namespace {

// The maker's support site.
constexpr std::string_view kSupportSite = "http://support.kestrel.example";

constexpr double kQuitDelay = 1.0;            // seconds
constexpr double kHideBeforeToolDelay = 0.5;  // seconds

// What the set-up tool answers by its exit status; every other status asks for a new search.
constexpr int kToolAsksToGoBack = 1;
constexpr int kToolAsksToQuit = 2;

// The characters of RFC 3986; with any other one the text is no address.
bool isURLCharacter(char c) {
  constexpr std::string_view kPunctuation = "-._~:/?#[]@!$&'()*+,;=%";
  return isASCIILetterOrDigit(c) || kPunctuation.find(c) != std::string_view::npos;
}

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
  const std::string url = std::string(kSupportSite) + "/g/d/c2f2/" + series + "/" +
                          localeLanguageCode() + "/" + asciiLowercased(localeCountryCode()) + "/";
  return std::all_of(url.begin(), url.end(), isURLCharacter) ? std::optional(url) : std::nullopt;
}

void OnrampOSXAppDelegate::openURL(const std::optional<std::string>& url) {
  if (url) onramp::openURL(*url);
}

}  // namespace onramp

#include "app/search_wait.h"

#include <any>
#include <cstdint>

#include "app/OnrampOSXAppDelegate.h"
#include "media/CommonMessage.h"
#include "pages/ChooseDeviceView.h"
#include "platform/alert.h"
#include "platform/operation_queue.h"
#include "platform/run_loop.h"

namespace onramp {

namespace {

void showProgressOn(Page* page, bool on) {
  if (auto* const connections = dynamic_cast<ConnectionTypeView*>(page)) {
    connections->progressON(on);
  } else if (auto* const devices = dynamic_cast<ChooseDeviceView*>(page)) {
    devices->progressON(on);
  }
}

// The medium's texts are format strings, in which "%%" means a percent sign. The sheet shows plain
// text, so this function replaces "%%" with "%".
std::string textOfFormat(std::string format) {
  for (std::size_t at = format.find("%%"); at != std::string::npos; at = format.find("%%", at)) {
    format.erase(at++, 1);
  }
  return format;
}

}  // namespace

void OnrampOSXAppDelegate::showProgress(const std::shared_ptr<Page>& page,
                                        std::chrono::seconds pause) {
  showProgressOn(page.get(), true);
  setWaiting(true);
  {
    OperationQueue queue;
    if (!queue.addOperation([this, pause] { waitDeviceSearchTask(pause); })) {
      waitOnMainLoop(pause, kMostPauses);
    }
    runModalForWindow(window);
  }
  showProgressOn(page.get(), false);
  if (ChooseDeviceView* const search = chooser()) search->stopBrowsing();
  setWaiting(false);
}

void OnrampOSXAppDelegate::setWaiting(bool waiting) {
  rightButton.setEnabled(!waiting);
  leftButton.setEnabled(!waiting);
  rightMostButton.setEnabled(!waiting);
  if (ChooseDeviceView* const list = chooser()) list->deviceListPopupButtonEnable(!waiting);
  canWindowClose = !waiting;
}

void OnrampOSXAppDelegate::waitDeviceSearchTask(std::chrono::seconds pause) const {
  for (int pauses = 0; pauses < kMostPauses; ++pauses) {
    if (!sleepOffMainThread(pause) || listedDevices() > 0) break;
  }
  abortModal();
}

// Replaces waitDeviceSearchTask() when the system cannot start another thread. Each pause is a
// timer in the modal loop.
void OnrampOSXAppDelegate::waitOnMainLoop(std::chrono::seconds pause, int pausesLeft) {
  scheduleTimer(pause, [this, pause, pausesLeft] {
    if (pausesLeft > 1 && listedDevices() == 0) {
      waitOnMainLoop(pause, pausesLeft - 1);
    } else {
      abortModal();
    }
  });
}

void OnrampOSXAppDelegate::showProgressAtChooseDeviceView(std::chrono::seconds pause) {
  showProgress(mChooseDeviceViewController, pause);
  const bool found = listedDevices() > 0;
  if (!found) showListAlertSheet();
  rightMostButton.setEnabled(found);
}

void OnrampOSXAppDelegate::showProgressAtChooseDeviceViewByRefresh(
    const Notification& notification) {
  const auto entry = notification.userInfo.find(kWaitTime);
  const auto* const seconds =
      entry == notification.userInfo.end() ? nullptr : std::any_cast<int>(&entry->second);
  showProgressAtChooseDeviceView(std::chrono::seconds(seconds ? *seconds : 0));
}

void OnrampOSXAppDelegate::showListAlertSheet() {
  const std::string message =
      localized("INST_TXT_ALERT_WIFI_DEVICENOTFOUND", "No device could be found over the network") +
      "\n\n" + localized("INST_TXT_ALERT_CONFIRM_DEVICENOTFOUND_WIFI", "Push the gear button");
  beginAlertSheet({.title = localized("INST_TXT_ALERT_DEVICENOTFOUND", "Device not found"),
                   .message = textOfFormat(message),
                   .defaultButton = localized("BTN_OK", "OK"),
                   .otherButton = localized("BTN_WEB", "WEB")},
                  window, [this](int returnCode) { didEndCloseSheet(returnCode); });
}

void OnrampOSXAppDelegate::didEndCloseSheet(int returnCode) {
  if (returnCode == kAlertOtherReturn) openURL(FAQ_URL());
}

}  // namespace onramp

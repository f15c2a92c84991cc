#include <any>

#include "app/OnrampOSXAppDelegate.h"
#include "media/CommonMessage.h"
#include "pages/ChooseDeviceView.h"
#include "platform/alert.h"
#include "platform/operation_queue.h"
#include "platform/run_loop.h"

namespace onramp {

namespace {

constexpr int kMostPauses = 5;

// The sheet reads its message as a format, in which a percent sign is written twice.
std::string textOfFormat(std::string format) {
  for (std::size_t at = format.find("%%"); at != std::string::npos; at = format.find("%%", at)) {
    format.erase(at++, 1);
  }
  return format;
}

}  // namespace

void OnrampOSXAppDelegate::showProgress(const std::shared_ptr<Page>& page, std::uint32_t seconds) {
  setWaiting(page, true);
  {
    OperationQueue queue;
    queue.addOperation([this, seconds] { waitDeviceSearchTask(seconds); });
    runModalForWindow(window);
  }
  setWaiting(page, false);
}

void OnrampOSXAppDelegate::setWaiting(const std::shared_ptr<Page>& page, bool waiting) {
  if (auto* const connections = dynamic_cast<ConnectionTypeView*>(page.get())) {
    connections->progressON(waiting);
  } else if (auto* const devices = dynamic_cast<ChooseDeviceView*>(page.get())) {
    devices->progressON(waiting);
  }
  ChooseDeviceView* const search = chooser();
  if (search && !waiting) search->stopBrowsing();
  rightButton.setEnabled(!waiting);
  leftButton.setEnabled(!waiting);
  rightMostButton.setEnabled(!waiting);
  if (search) search->deviceListPopupButtonEnable(!waiting);
  canWindowClose = !waiting;
}

void OnrampOSXAppDelegate::waitDeviceSearchTask(std::uint32_t seconds) const {
  for (int pause = 0; pause < kMostPauses; ++pause) {
    if (!sleepOffMainThread(seconds) || listedDevices() > 0) break;
  }
  abortModal();
}

void OnrampOSXAppDelegate::showProgressAtChooseDeviceView(std::uint32_t seconds) {
  showProgress(mChooseDeviceViewController, seconds);
  const bool found = listedDevices() > 0;
  if (!found) showListAlertSheet();
  rightMostButton.setEnabled(found);
}

void OnrampOSXAppDelegate::showProgressAtChooseDeviceViewByRefresh(
    const Notification& notification) {
  const auto entry = notification.userInfo.find(kWaitTime);
  const auto* const seconds =
      entry == notification.userInfo.end() ? nullptr : std::any_cast<int>(&entry->second);
  showProgressAtChooseDeviceView(seconds ? static_cast<std::uint32_t>(*seconds) : 0);
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

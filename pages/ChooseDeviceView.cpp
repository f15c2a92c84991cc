#include "pages/ChooseDeviceView.h"

#include <utility>

#include "base/notification_center.h"
#include "bonjour/KSDevice.h"
#include "bonjour/model_match.h"
#include "media/CommonMessage.h"
#include "media/KSInstallerInfo.h"
#include "platform/bundle.h"
#include "platform/run_loop.h"
#include "snmp/query.h"

namespace onramp {

namespace {

// Returns the set-up tool's display name in the user's language. If there is none, returns the last
// part of the tool's path without the extension. Returns an empty string when the medium cannot be
// read.
std::string setupToolName() {
  const std::optional<FileURL> tool = KSInstallerInfo().WLANtoolURL();
  if (!tool) return "";
  if (const auto bundle = Bundle::open(tool->path)) {
    if (auto name = bundle->localizedInfoString("CFBundleDisplayName")) return *name;
  }
  std::string name = tool->path.substr(tool->path.rfind('/') + 1);
  return name.substr(0, name.rfind('.'));
}

Dictionary entryFor(const Dictionary& device) {
  const Array* const addresses = device.array(KSDevice::kIPAddressList);
  std::vector<Dictionary::Pair> entry{
      {std::string(ChooseDeviceView::kDevice), device.string(KSDevice::kDisplayName).value_or("")},
      {std::string(ChooseDeviceView::kInterface),
       localized("INST_TXT_CONNECTION_NETWORK", "Network")},
      {std::string(ChooseDeviceView::kKSDevice), device}};
  if (addresses && !addresses->empty()) {
    entry.emplace_back(ChooseDeviceView::kLocation, addresses->front());
  }
  return Dictionary(std::move(entry));
}

}  // namespace

ChooseDeviceView::ChooseDeviceView(std::unique_ptr<Interface> interface)
    : Page(std::move(interface)),
      deviceListView(outlet<TableView>("deviceListView")),
      deviceListTitle(outlet<TextField>("deviceListTitle")),
      deviceListPopupButton(outlet<PopUpButton>("deviceListPopupButton")),
      progressTxtField(outlet<TextField>("progressTxtField")),
      progress(outlet<ProgressIndicator>("progress")) {
  awakeFromNib();
}

ChooseDeviceView::~ChooseDeviceView() {
  stopBrowsing();
  destroyView();
}

void ChooseDeviceView::awakeFromNib() {
  deviceListTitle.setStringValue(localized("INST_TXT_DEVLIST"));
  fillPopUpMenu();

  deviceListView.setAllowsColumnReordering(false);
  deviceListView.setAllowsColumnSelection(false);
  deviceListView.setColumnHeader(kDevice, localized("INST_TXT_DEVICE"));
  deviceListView.setColumnHeader(kInterface, localized("INST_TXT_CONNECTION"));
  deviceListView.setColumnHeader(kLocation, localized("INST_TXT_IPADDRESS"));
  for (const std::string_view column : {kDevice, kInterface, kLocation}) {
    deviceListView.setColumnEditable(column, false);
  }

  deviceArrayController.setSortKey(std::string(kDevice));
  progressTxtField.setStringValue(localized("INST_WAIT"));
  deviceArrayController.rearrange();
  deviceArrayController.setSelectionIndex(0);
  deviceListView.bind(deviceArrayController);
  progressON(false);
}

void ChooseDeviceView::fillPopUpMenu() {
  for (std::size_t item = deviceListPopupButton.numberOfItems(); item > 1; --item) {
    deviceListPopupButton.removeItem(item - 1);
  }
  deviceListPopupButton.addItem(setupToolName() + "...", [this] { setupWizardMenu(); });
  deviceListPopupButton.addItem(localized("INST_TXT_REFRESH"), [this] { refreshBrowsing(); });
}

void ChooseDeviceView::setSearchModelList(std::vector<std::string> models) {
  searchModelList = std::move(models);
}

void ChooseDeviceView::startBrowsing() {
  stopBrowsing();
  mBonjourSearch = KSBonjourSearch::init();
  mBonjourSearch->addKSDeviceObserver(shared_from_this());
  mBonjourSearch->startBrowsing();
}

void ChooseDeviceView::stopBrowsing() {
  if (!mBonjourSearch) return;
  mBonjourSearch->stopBrowsing();
  mBonjourSearch->removeKSDeviceObserver(this);
  // The search object may be calling this function, so it is destroyed only after the current
  // event.
  performOnMainThread([search = std::exchange(mBonjourSearch, nullptr)] {});
}

void ChooseDeviceView::refreshBrowsing() {
  stopBrowsing();
  deviceArrayController.removeAllObjects();
  deviceArrayController.rearrange();
  startBrowsing();
  NotificationCenter::defaultCenter().post(
      {.name = std::string(kDeviceWaitNotification),
       .object = this,
       .userInfo = {{std::string(kWaitTime), static_cast<int>(kRefreshPause.count())}}});
}

void ChooseDeviceView::setupWizardMenu() {
  stopBrowsing();
  NotificationCenter::defaultCenter().post(
      {.name = std::string(kLaunchWLANToolNotification), .object = nullptr, .userInfo = {}});
}

std::size_t ChooseDeviceView::deviceArrayControllerCnt() const {
  return deviceArrayController.arrangedCount();
}

std::optional<Dictionary> ChooseDeviceView::choosedDevice() const {
  return deviceArrayController.selectedObject();
}

void ChooseDeviceView::addKSDevice(const Dictionary& device) {
  if (doesMatchedModel(device) && doesWiFi(device)) setServiceToList(device);
}

void ChooseDeviceView::updateKSDevice(const Dictionary& device) {
  addKSDevice(device);
}

void ChooseDeviceView::removeKSDevice(const Dictionary& device) {
  if (doesMatchedModel(device)) removeServiceFromList(device);
}

bool ChooseDeviceView::doesMatchedModel(const Dictionary& device) const {
  return isOneOf(searchModelList, device);
}

bool ChooseDeviceView::doesWiFi(const Dictionary& device) {
  const Array* const addresses = device.array(KSDevice::kIPAddressList);
  return addresses && snmp_active_interface_is_wireless(*addresses);
}

void ChooseDeviceView::setServiceToList(const Dictionary& device) {
  const Dictionary entry = entryFor(device);
  const bool isChoice =
      deviceArrayController.hasChoice() && deviceArrayController.selectedObject() == entry;
  removeServiceFromList(device);
  deviceArrayController.addObjects({entry});
  deviceArrayController.rearrange();
  // The first row is selected until the user chooses a row. New reports of devices do not change
  // the user's choice.
  if (isChoice) {
    deviceArrayController.chooseObject(entry);
  } else if (!deviceArrayController.hasChoice()) {
    deviceArrayController.setSelectionIndex(0);
  }
}

void ChooseDeviceView::removeServiceFromList(const Dictionary& device) {
  deviceArrayController.removeObject(entryFor(device));
}

void ChooseDeviceView::deviceListPopupButtonEnable(bool enable) {
  deviceListPopupButton.setEnabled(enable);
}

void ChooseDeviceView::progressON(bool on) {
  showWaiting(progress, progressTxtField, on);
}

}  // namespace onramp

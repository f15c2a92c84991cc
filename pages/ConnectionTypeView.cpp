#include "pages/ConnectionTypeView.h"

#include <utility>

#include "media/CommonMessage.h"

namespace onramp {

ConnectionTypeView::ConnectionTypeView(std::unique_ptr<Interface> interface)
    : Page(std::move(interface)),
      connectionTypeTitle(outlet<TextField>("connectionTypeTitle")),
      connectionDescriptionTextField(outlet<TextField>("connectionDescriptionTextField")),
      connectionTypeRadioButton(outlet<RadioMatrix>("connectionTypeRadioButton")),
      connectionTypeImage1(outlet<ImageView>("connectionTypeImage1")),
      connectionTypeImage2(outlet<ImageView>("connectionTypeImage2")),
      progressTxtField(outlet<TextField>("progressTxtField")),
      progress(outlet<ProgressIndicator>("progress")) {
  awakeFromNib();
}

void ConnectionTypeView::awakeFromNib() {
  connectionTypeTitle.setStringValue(localized("INST_TXT_CONNECTIONTYPE"));
  connectionDescriptionTextField.setStringValue(localized("INST_TXT_CONNECTIONTYPE_DESC"));
  setChooseButton(kWirelessRow, 0);
  progressTxtField.setStringValue(localized("INST_WAIT"));
  progressON(false);
}

void ConnectionTypeView::setConnectionType(ConnectionType type) {
  const std::string images = commonImagesFolderPath();
  connectionTypeImage1.setImage({images + "/wirelessLan.png"});
  connectionTypeRadioButton.setTitle(kWirelessRow, 0, localized("INST_TXT_WIFI"));
  if (type == ConnectionType::kUSBAndEthernet) {
    connectionTypeImage2.setImage({images + "/wiredLan.png"});
    connectionTypeRadioButton.setTitle(
        kWiredRow, 0, localized("INST_TXT_USB") + "\n" + localized("INST_TXT_ETHERNET"));
  } else {
    connectionTypeImage2.setImage({images + "/usb.png"});
    connectionTypeRadioButton.setTitle(kWiredRow, 0, localized("INST_TXT_USB"));
  }
}

int ConnectionTypeView::chooseDeviceType() const {
  return connectionTypeRadioButton.selectedRow();
}

void ConnectionTypeView::setChooseButton(int row, int column) {
  connectionTypeRadioButton.selectCell(row, column);
}

void ConnectionTypeView::progressON(bool on) {
  showWaiting(progress, progressTxtField, on);
  connectionTypeRadioButton.setEnabled(!on);
}

std::string ConnectionTypeView::commonImagesFolderPath() {
  return CommonMessage::convertRelativePathToFullPath("MacResources/Images");
}

}  // namespace onramp

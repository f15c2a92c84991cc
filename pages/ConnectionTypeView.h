#pragma once

#include <memory>
#include <string>

#include "media/connection_type.h"
#include "pages/page.h"
#include "platform/outlets.h"

namespace onramp {

/// The page that asks how the device is connected. A new page object is created each time the page
/// is shown.
class ConnectionTypeView final : public Page {
 public:
  // Rows of the radio buttons.
  static constexpr int kWirelessRow = 0;
  static constexpr int kWiredRow = 1;

  explicit ConnectionTypeView(std::unique_ptr<Interface> interface);

  /// Sets the titles and images of both choices. The wired choice is USB and Ethernet for
  /// kUSBAndEthernet, and only USB for any other type. The selection does not change.
  void setConnectionType(ConnectionType type);

  /// The selected row: kWirelessRow or kWiredRow.
  [[nodiscard]] int chooseDeviceType() const;

  /// Selects the choice in `row`. `column` must be 0.
  void setChooseButton(int row, int column);

  /// Shows or hides the spinner and the text beside it, which asks the user to wait. While they are
  /// shown, the user cannot change the choice.
  void progressON(bool on);

  /// The full path of the medium's image folder.
  [[nodiscard]] static std::string commonImagesFolderPath();

 private:
  void awakeFromNib();

  TextField connectionTypeTitle;
  TextField connectionDescriptionTextField;
  RadioMatrix connectionTypeRadioButton;
  ImageView connectionTypeImage1;
  ImageView connectionTypeImage2;
  TextField progressTxtField;
  ProgressIndicator progress;
};

}  // namespace onramp

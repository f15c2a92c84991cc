#pragma once

#include <cstddef>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "base/array_controller.h"
#include "base/value.h"
#include "bonjour/KSBonjourSearch.h"
#include "pages/page.h"
#include "platform/outlets.h"

namespace onramp {

// What the page asks the application for, by notification.

/// Launch the wireless set-up tool. Carries nothing.
inline constexpr std::string_view kLaunchWLANToolNotification = "addNotificationLaunchWLANTool";

/// Wait for the device search. Carries under kWaitTime the seconds per pause, an int.
inline constexpr std::string_view kDeviceWaitNotification = "notificationDeviceWait";
inline constexpr std::string_view kWaitTime = "WAIT_TIME";

/// The page that lists the devices found on the network: those of the models looked for that say
/// themselves that they are on wireless. Made once; its list and its search survive page changes.
/// While it searches, the search holds it: stopBrowsing() lets go.
class ChooseDeviceView final : public Page,
                               public KSDeviceObserver,
                               public std::enable_shared_from_this<ChooseDeviceView> {
 public:
  // Keys of a list entry.
  static constexpr std::string_view kDevice = "device";        ///< string, the device's name
  static constexpr std::string_view kInterface = "interface";  ///< string, how it is connected
  static constexpr std::string_view kLocation = "location";    ///< string, its first address
  static constexpr std::string_view kKSDevice = "ksdevice";    ///< dictionary, the device record

  explicit ChooseDeviceView(std::unique_ptr<Interface> interface);
  ChooseDeviceView(const ChooseDeviceView&) = delete;
  ChooseDeviceView& operator=(const ChooseDeviceView&) = delete;
  ~ChooseDeviceView() override;

  /// The models to look for, as "manufacturer model" texts.
  void setSearchModelList(std::vector<std::string> models);

  /// Starts a new search; the list keeps what it has.
  void startBrowsing();

  /// Ends the search; the list keeps what it has. Without a search, nothing.
  void stopBrowsing();

  /// Empties the list, starts a new search and asks the application to wait for it.
  void refreshBrowsing();

  /// Ends the search and asks the application to launch the wireless set-up tool.
  void setupWizardMenu();

  /// The number of devices listed. Callable from any thread.
  [[nodiscard]] std::size_t deviceArrayControllerCnt() const;

  /// The selected list entry; nothing when none is selected.
  [[nodiscard]] std::optional<Dictionary> choosedDevice() const;

  void deviceListPopupButtonEnable(bool enable);

  /// Shows or hides the waiting state.
  void progressON(bool on);

  /// From the search. Asking a device whether it is on wireless may block for seconds.
  void addKSDevice(const Dictionary& device) override;
  void updateKSDevice(const Dictionary& device) override;
  void removeKSDevice(const Dictionary& device) override;

  /// Whether the device is one of the models looked for. Without any, none is.
  [[nodiscard]] bool doesMatchedModel(const Dictionary& device) const;

  /// Whether the device answers that it is on wireless. Blocks.
  [[nodiscard]] static bool doesWiFi(const Dictionary& device);

  /// Lists the device, in place of an entry equal to the one that it makes.
  void setServiceToList(const Dictionary& device);

  /// Takes the entry equal to the one that the device makes off the list.
  void removeServiceFromList(const Dictionary& device);

 private:
  void awakeFromNib();
  void fillPopUpMenu();

  std::shared_ptr<KSBonjourSearch> mBonjourSearch;  ///< null when not browsing
  std::vector<std::string> searchModelList;

  // The controller comes before the table that is bound to it.
  ArrayController deviceArrayController;
  TableView deviceListView;
  TextField deviceListTitle;
  PopUpButton deviceListPopupButton;
  TextField progressTxtField;
  ProgressIndicator progress;
};

}  // namespace onramp

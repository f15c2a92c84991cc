#pragma once

#include <chrono>
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

// The notifications that the chooser (ChooseDeviceView) posts to the controller
// (OnrampOSXAppDelegate).

/// Asks the controller to launch the wireless set-up tool. Carries no user info.
inline constexpr std::string_view kLaunchWLANToolNotification = "addNotificationLaunchWLANTool";

/// Asks the controller to wait a limited time for a device to be listed. The user info holds an
/// int under kWaitTime: how many seconds the controller sleeps before each check of the list (see
/// app/search_wait.h).
inline constexpr std::string_view kDeviceWaitNotification = "notificationDeviceWait";
inline constexpr std::string_view kWaitTime = "WAIT_TIME";

/// The page that lists the devices found on the network. It lists a device if the device's model
/// was passed to setSearchModelList() and the device reports that it is using its wireless
/// interface. The wizard creates this page only once. While the window shows another page, this
/// page keeps its list, and a running search continues. A running search shares ownership of the
/// page until stopBrowsing() is called.
class ChooseDeviceView final : public Page,
                               public KSDeviceObserver,
                               public std::enable_shared_from_this<ChooseDeviceView> {
 public:
  // Keys of a list entry.
  static constexpr std::string_view kDevice = "device";        ///< string, the device's name
  static constexpr std::string_view kInterface = "interface";  ///< string, localized "Network"
  static constexpr std::string_view kLocation = "location";  ///< string, the first address, if any
  static constexpr std::string_view kKSDevice = "ksdevice";  ///< dictionary, the device record

  /// How long the controller sleeps before each check of the list, when refreshBrowsing() asks it
  /// to wait.
  static constexpr std::chrono::seconds kRefreshPause{3};

  explicit ChooseDeviceView(std::unique_ptr<Interface> interface);
  ChooseDeviceView(const ChooseDeviceView&) = delete;
  ChooseDeviceView& operator=(const ChooseDeviceView&) = delete;
  ~ChooseDeviceView() override;

  /// Sets the models to look for, as strings of the form "manufacturer model".
  void setSearchModelList(std::vector<std::string> models);

  /// Ends any running search and starts a new one. The list keeps its entries.
  void startBrowsing();

  /// Ends the search. The list keeps its entries. Does nothing when no search is running.
  void stopBrowsing();

  /// Empties the list, starts a new search and asks the controller to wait for devices. Returns
  /// when the wait is over.
  void refreshBrowsing();

  /// Ends the search and asks the controller to launch the wireless set-up tool.
  void setupWizardMenu();

  /// The number of devices listed. Callable from any thread.
  [[nodiscard]] std::size_t deviceArrayControllerCnt() const;

  /// Returns the selected list entry, or nothing when no entry is selected.
  [[nodiscard]] std::optional<Dictionary> choosedDevice() const;

  /// Enables or disables the pop-up button whose menu holds the page's commands.
  void deviceListPopupButtonEnable(bool enable);

  /// Shows or hides the spinner and the text beside it, which asks the user to wait.
  void progressON(bool on);

  /// The search calls these three functions. addKSDevice() and updateKSDevice() call
  /// setServiceToList() if doesMatchedModel() and doesWiFi() return true. They call doesWiFi()
  /// second, because it may block for seconds. removeKSDevice() calls removeServiceFromList() if
  /// doesMatchedModel() returns true.
  void addKSDevice(const Dictionary& device) override;
  void updateKSDevice(const Dictionary& device) override;
  void removeKSDevice(const Dictionary& device) override;

  /// Whether the device's model is one of those passed to setSearchModelList().
  [[nodiscard]] bool doesMatchedModel(const Dictionary& device) const;

  /// Whether the device reports that it is using its wireless interface. Returns false when the
  /// record has no addresses. Blocks for about 12 seconds for each address that does not respond.
  [[nodiscard]] static bool doesWiFi(const Dictionary& device);

  /// Adds the device's entry to the list, replacing any equal entry. The entry that the user has
  /// chosen stays selected. Until the user chooses an entry, the first one is selected.
  void setServiceToList(const Dictionary& device);

  /// Removes the entry that setServiceToList() would add for `device`. Does nothing when the list
  /// has no equal entry.
  void removeServiceFromList(const Dictionary& device);

 private:
  void awakeFromNib();
  void fillPopUpMenu();

  std::shared_ptr<KSBonjourSearch> mBonjourSearch;  ///< null when not browsing
  std::vector<std::string> searchModelList;

  ArrayController deviceArrayController;
  TableView deviceListView;
  TextField deviceListTitle;
  PopUpButton deviceListPopupButton;
  TextField progressTxtField;
  ProgressIndicator progress;
};

}  // namespace onramp

#pragma once

#include <chrono>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "base/notification_center.h"
#include "base/value.h"
#include "media/KSInstallerInfo.h"
#include "media/system_range.h"
#include "pages/ConnectionTypeView.h"
#include "pages/page.h"
#include "platform/application.h"
#include "platform/outlets.h"

namespace onramp {

class ChooseDeviceView;
class ModelListView;

/// Who started the wireless set-up tool: the wizard (because a search found no device) or the user.
enum class ToolStart { kAutomatic, kManual };

/// The wizard's only controller. It owns the pages, remembers the user's choices, decides which
/// page is shown and passes the choices to the installer package. The functions are grouped by the
/// source file that defines them. All functions except waitDeviceSearchTask() and listedDevices()
/// must be called on the main thread.
class OnrampOSXAppDelegate final : public ApplicationDelegate {
 public:
  OnrampOSXAppDelegate();
  OnrampOSXAppDelegate(const OnrampOSXAppDelegate&) = delete;
  OnrampOSXAppDelegate& operator=(const OnrampOSXAppDelegate&) = delete;
  ~OnrampOSXAppDelegate() override;

  // start_up.cpp: start-up, closing and the choice of the first page.

  void setOutlets(const Interface& mainInterface) override;

  /// Sets up the window, its background picture and the application menu.
  void awakeFromNib() override;

  /// Checks the system's version. On a supported system, deletes the files that earlier runs wrote
  /// for the installer package. On any other system, closes the window, shows an alert and
  /// terminates the application.
  void applicationWillFinishLaunching() override;

  /// Shows the first page. When no model on the medium supports wireless, opens the installer
  /// package and quits instead.
  void applicationDidFinishLaunching() override;
  [[nodiscard]] bool applicationShouldTerminateAfterLastWindowClosed() override { return true; }

  /// Returns whether the window may close: false while the wizard waits for a device search.
  [[nodiscard]] bool windowShouldClose(const Window& closing) override;

  /// Asks the application to terminate.
  void close();

  // connection_types.cpp: the connections that the medium's models support.

  /// Whether any of `models` supports wireless.
  [[nodiscard]] static bool isSupportWiFi(const std::vector<std::string>& models);

  /// Returns the connection type of a model. `usb` and `ethernet` say whether the model supports
  /// USB and wired Ethernet.
  [[nodiscard]] static ConnectionType isIFType(bool usb, bool ethernet);

  /// Returns the type of the model called `model`, or kNeither when `model` has no value.
  [[nodiscard]] static ConnectionType isIFType(const std::optional<std::string>& model);

  /// Returns the type that all of `models` share. Returns kNeither when any two models differ, or
  /// when there are no models.
  [[nodiscard]] static ConnectionType checkIF(const std::vector<std::string>& models);

  // navigation.cpp: pages and buttons.

  /// Loads the page from the interface file `name`. Returns null when the file is missing, cannot
  /// be read or contains no view.
  [[nodiscard]] std::shared_ptr<Page> loadView(const std::string& name);

  /// Replaces the current page with `page` or, if `page` is null, with a new page from the
  /// interface file `name`. If the new page cannot be loaded, the window shows no page.
  void replaceMainView(const std::string& name, std::shared_ptr<Page> page);

  /// Shows a new model-list page.
  void showModelListView();

  /// Shows a new connection page for `type`. Also tells the chooser (ChooseDeviceView) which models
  /// to look for: the model that the user has chosen, or all models on the medium if the user has
  /// chosen none.
  void showConnectionTypeView(ConnectionType type);

  /// The effect depends on the current page:
  /// - On the chooser: searches again.
  /// - On the connection page, if mIsWLANTool is false: shows the chooser if it lists a device, and
  ///   otherwise starts the wireless set-up tool.
  /// - In all other cases: shows the chooser and searches.
  void showChooseDeviceView();

  /// Makes `image` the window's background, stretched to fit. Does nothing if `image` has no value.
  void setBackGroundView(const std::optional<Image>& image);

  /// Each of these functions sets up the buttons for one page: their titles, and whether they are
  /// hidden. Every page has Next and Cancel. The connection page also has Back if the user has
  /// chosen a model, and the chooser has Back if mIsWLANTool is false. None of these functions
  /// enables or disables a button.
  void setModelListViewButton();
  void setConnentionTypeViewButton();
  void setChooseDeviceViewButton();

  /// Each of these functions gives a button the title "Cancel", "Back" or "Next" in the user's
  /// language. The button is the one whose title is bound to the key `titleKey` of boundTexts().
  void setCancelButton(std::string_view titleKey);
  void setBackButton(std::string_view titleKey);
  void setNextButton(std::string_view titleKey);

  void performAction(std::string_view action) override;

  // The buttons' actions. The rightmost button is Next. The button to its left is Back, or Cancel
  // on a page without Back. The other two buttons always quit. If the current page is not the model
  // list, the connection page or the chooser, every button quits.
  void rightMostButtonClicked();
  void rightButtonClicked();
  void leftButtonClicked();
  void leftMostButtonClicked();

  // system_check.cpp: does the medium support the running system?

  /// Returns the components of the running system's version, or an empty list when the version is
  /// unknown.
  [[nodiscard]] static std::vector<std::string> getSystemVersion();

  /// Each of these functions compares the running system's version with one bound of the range that
  /// the medium supports. supportedOSMaxCheck() returns kNewerThanMaximum if isNewerThan() returns
  /// true. supportedOSMinCheck() returns kOlderThanMinimum if isOlderThan() returns true.
  /// Otherwise, each function returns kSupported. Unlike installationCheck(), they do not skip a
  /// bound whose "Major" is 0.
  [[nodiscard]] SystemSupport supportedOSMaxCheck() const;
  [[nodiscard]] SystemSupport supportedOSMinCheck() const;

  /// Checks whether the running system's version is above the medium's maximum, and then whether it
  /// is below the minimum. Skips a bound whose "Major" is 0. Returns kNewerThanMaximum,
  /// kOlderThanMinimum or, if the version is in the range, kSupported.
  [[nodiscard]] SystemSupport installationCheck() const;

  /// Returns the oldest system version that the medium supports, such as "10.6.0".
  [[nodiscard]] std::string supportSystemMinString() const;

  /// Shows an alert that says why the system is not supported. Returns when the user dismisses the
  /// alert or the application terminates. Does nothing if `type` is kSupported. Ignores `parent`.
  void showSystemNotSpecifiedAlert(const Window& parent, SystemSupport type) const;

  // hand_off.cpp: the files that pass the user's choices to the installer package.

  /// Returns the medium's vendor name without its spaces, or an empty string when the medium names
  /// no vendor.
  [[nodiscard]] static std::string setVenderName();

  /// Returns the path of the package-options file, which passes the medium's options to the
  /// package. If the file's folder is missing, creates the folder and makes it writable for every
  /// user. Ignores failures.
  [[nodiscard]] static std::string InstallPKGInfoURL();

  /// Returns the path of the model file, which names the device's model and connection. Creates the
  /// file's folder if it is missing. Ignores failures.
  [[nodiscard]] static std::string instmodelPlistURL();

  /// Writes the package-options file. It holds the options that the medium description has under
  /// "InstallPKG", and the five standard options that docs/mastering-a-medium.md describes. Ignores
  /// failures.
  static void copyCDInfo();

  /// Returns the model file's contents for a device that is connected by a USB or Ethernet cable.
  [[nodiscard]] static Dictionary instmodelPlistNotWiFi(const std::string& model);

  /// Returns the model file's contents for the wireless device whose KSDevice record is `property`.
  /// Falls back to instmodelPlistNotWiFi() when `property` has no value or lacks a name or an
  /// address, and when the medium names no service type. The fallback uses the name `model`, or an
  /// empty name if `model` has no value.
  [[nodiscard]] static Dictionary instmodelPlistWiFi(const std::optional<std::string>& model,
                                                     const std::optional<Dictionary>& property);

  // launching.cpp: starting the package, the set-up tool and the support page.

  /// Writes the package-options file and opens the package. Returns false when the medium has no
  /// package for the system, or when openFile() returns false.
  bool launchPackage();

  /// Terminates the application after one second, so that the package has time to open. Returns at
  /// once.
  void quitMe();

  /// Call launchWLANToolAutomatically() after a search that found no device, and
  /// launchWLANToolManually() when the user asks for the wireless set-up tool. Both hide the wizard
  /// and return. The tool runs half a second later. When the tool has exited, the wizard acts on
  /// the exit status:
  /// - 1: The wizard reappears. After an automatic start, it reappears on the connection page with
  ///   the wireless choice selected.
  /// - 2: The wizard terminates.
  /// - Any other status, or none because the tool could not be run or was killed: The wizard
  ///   reappears, shows the chooser and searches.
  void launchWLANToolAutomatically();
  void launchWLANToolManually();

  /// Returns the URL of the support page for this medium and the user's language and country.
  /// Returns nothing when the URL would be invalid, for example because the medium's series code
  /// contains a space.
  [[nodiscard]] static std::optional<std::string> FAQ_URL();

  /// Opens `url` in the user's browser. Does nothing if `url` has no value.
  static void openURL(const std::optional<std::string>& url);

  // search_wait.cpp: the wait for the device search.

  /// Waits in a modal loop for up to kMostPauses pauses of length `pause`. If the chooser lists a
  /// device at the end of a pause, skips the remaining pauses. Ends the search after the wait.
  /// During the wait, the user can neither click a button nor close the window, and `page` shows
  /// its spinner. `page` may be null.
  void showProgress(const std::shared_ptr<Page>& page, std::chrono::seconds pause);

  /// Sleeps for `pause` up to kMostPauses times. Stops early if the chooser lists a device after a
  /// sleep, or if the application terminates. Then ends the modal loop. Must not be called on the
  /// main thread.
  void waitDeviceSearchTask(std::chrono::seconds pause) const;

  /// Calls showProgress() with the chooser as the page. Then enables Next if a device is listed. If
  /// not, disables Next and tells the user in a sheet that no device was found.
  void showProgressAtChooseDeviceView(std::chrono::seconds pause);

  /// Calls showProgressAtChooseDeviceView() with the number of seconds stored under kWaitTime in
  /// the notification's user info, or with 0 if none is stored.
  void showProgressAtChooseDeviceViewByRefresh(const Notification& notification);

  /// Tells the user in a sheet that no device was found, and returns at once.
  void showListAlertSheet();

  /// Opens the support page if `returnCode` is kAlertOtherReturn, that is, if the user clicked the
  /// sheet's second button.
  void didEndCloseSheet(int returnCode);

 private:
  [[nodiscard]] static std::vector<std::string> allContainedModels();

  /// Returns the chooser, or null when it could not be loaded.
  [[nodiscard]] ChooseDeviceView* chooser() const;

  /// Returns the number of devices that the chooser lists, or 0 when there is no chooser. Callable
  /// from any thread.
  [[nodiscard]] std::size_t listedDevices() const;

  /// Returns the current page if it is a PageClass, otherwise null.
  template <typename PageClass>
  [[nodiscard]] PageClass* shownPage() const {
    return dynamic_cast<PageClass*>(mShownPage.get());
  }

  void setButton(std::string_view titleKey, const std::string& title);
  void setBackAndCancel(bool canGoBack);
  void searchOnChooser();
  void nextFromModelList(const ModelListView& page);
  void nextFromConnectionType(const ConnectionTypeView& page);
  void nextFromChooser(const ChooseDeviceView& page);
  void backToModelList();
  void backToConnectionType();

  /// Finishes the wizard's work: writes `modelFile` if it has a value, opens the package and quits.
  void handOverAndQuit(const std::optional<Dictionary>& modelFile);

  void launchWLANTool(ToolStart start);
  void performTimerQuitMe();
  void performLaunchWLANTool(ToolStart start);
  void setWaiting(bool waiting);
  void waitOnMainLoop(std::chrono::seconds pause, int pausesLeft);

  Window window;
  View mainView;
  bool canWindowClose = true;
  Button leftMostButton;
  Button leftButton;
  Button rightMostButton;
  Button rightButton;
  ImageView mBackGroundView;
  KSInstallerInfo mKSInstallerInfo;
  Dictionary mKSCD;
  std::optional<std::string> mChoosedModel;  ///< no value until the user chooses a model
  std::uint32_t mContainedModelCount = 0;
  /// Becomes true when the wizard starts the set-up tool automatically. Becomes false again if the
  /// tool then asks to go back to the connection page.
  bool mIsWLANTool = false;
  std::shared_ptr<Page> mChooseDeviceViewController;
  std::shared_ptr<Page> mShownPage;  ///< the current page; may be null
};

}  // namespace onramp

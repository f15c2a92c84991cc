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

/// Who started the wireless set-up tool: the wizard itself, after a search that found no device, or
/// the user.
enum class ToolStart { kAutomatic, kManual };

/// The wizard's only controller. It owns the state, decides which page is shown and passes the
/// user's choices to the installer package. Each group of functions has its own source file. All
/// functions must be called on the main thread, except waitDeviceSearchTask() and listedDevices().
class OnrampOSXAppDelegate final : public ApplicationDelegate {
 public:
  OnrampOSXAppDelegate();
  OnrampOSXAppDelegate(const OnrampOSXAppDelegate&) = delete;
  OnrampOSXAppDelegate& operator=(const OnrampOSXAppDelegate&) = delete;
  ~OnrampOSXAppDelegate() override;

  // start_up.cpp: start, end and the choice of the first page.

  void setOutlets(const Interface& mainInterface) override;

  /// Sets up the window, its background picture and the application menu.
  void awakeFromNib() override;

  /// Checks the system's version. On a supported system, deletes the files that earlier runs wrote
  /// for the installer package. On any other system, closes the window, shows an alert and
  /// terminates the application.
  void applicationWillFinishLaunching() override;

  /// Shows the first page, or opens the package and quits when no model on the medium supports
  /// wireless.
  void applicationDidFinishLaunching() override;
  [[nodiscard]] bool applicationShouldTerminateAfterLastWindowClosed() override { return true; }

  /// Returns whether the window may close: false while the wizard waits for a device search.
  [[nodiscard]] bool windowShouldClose(const Window& closing) override;

  /// Asks the application to terminate.
  void close();

  // connection_types.cpp: the connections that the medium's models support.

  /// Whether any of `models` supports wireless.
  [[nodiscard]] static bool isSupportWiFi(const std::vector<std::string>& models);

  /// Returns the connection type of a model; `usb` and `ethernet` say whether it supports USB and
  /// wired Ethernet.
  [[nodiscard]] static ConnectionType isIFType(bool usb, bool ethernet);

  /// Returns the type of the model called `model`; kNeither without a name.
  [[nodiscard]] static ConnectionType isIFType(const std::optional<std::string>& model);

  /// Returns the type that all of `models` share; kNeither when any two differ, or when there are
  /// none.
  [[nodiscard]] static ConnectionType checkIF(const std::vector<std::string>& models);

  // navigation.cpp: pages and buttons.

  /// Loads the page from the interface file `name`. Returns null when the file is missing or
  /// unreadable, or holds no view.
  [[nodiscard]] std::shared_ptr<Page> loadView(const std::string& name);

  /// Removes the page that is shown, then shows `page`. When `page` is null, loads a new page from
  /// the interface file `name` instead. The window shows no page when that page cannot be loaded.
  void replaceMainView(const std::string& name, std::shared_ptr<Page> page);

  /// showModelListView() shows a new model list; showConnectionTypeView() shows a new connection
  /// page for `type`. The latter also tells the chooser, a ChooseDeviceView, which models to look
  /// for: the model that the user chose, or else all models on the medium.
  void showModelListView();
  void showConnectionTypeView(ConnectionType type);

  /// On the chooser, searches again. On the connection page, shows the chooser if it lists a
  /// device, and otherwise starts the wireless set-up tool. On any other page, and on the
  /// connection page after the wizard has started the tool, shows the chooser and searches.
  void showChooseDeviceView();

  /// Shows `image` stretched over the window's background. Does nothing without an image.
  void setBackGroundView(const std::optional<Image>& image);

  /// Set the titles of a page's buttons and show or hide each button. Every page has Next and
  /// Cancel. The connection page also has Back if the user chose a model, and the chooser has Back
  /// unless the wizard itself has started the set-up tool. These functions neither enable nor
  /// disable a button.
  void setModelListViewButton();
  void setConnentionTypeViewButton();
  void setChooseDeviceViewButton();

  /// Set the text under `titleKey`, which is a button's title, to the localized "Cancel", "Back"
  /// and "Next", in this order.
  void setCancelButton(std::string_view titleKey);
  void setBackButton(std::string_view titleKey);
  void setNextButton(std::string_view titleKey);

  void performAction(std::string_view action) override;

  // The buttons' actions. The rightmost button is Next. The button to its left is Back, or Cancel
  // on a page without Back. The other two buttons always quit. Every button quits when none of the
  // three pages is shown.
  void rightMostButtonClicked();
  void rightButtonClicked();
  void leftButtonClicked();
  void leftMostButtonClicked();

  // system_check.cpp: does the medium support the running system?

  /// The components of the running system's version; empty when the version is unknown.
  [[nodiscard]] static std::vector<std::string> getSystemVersion();

  /// Compare the running system's version with the medium's maximum and minimum, by the rules of
  /// isNewerThan() and isOlderThan(), and return kSupported when the version is within the bound.
  /// Unlike installationCheck(), these functions do not skip a bound whose "Major" is 0.
  [[nodiscard]] SystemSupport supportedOSMaxCheck() const;
  [[nodiscard]] SystemSupport supportedOSMinCheck() const;

  /// Checks the maximum first, then the minimum. Skips a bound whose "Major" is 0.
  [[nodiscard]] SystemSupport installationCheck() const;

  /// The minimum version as text, such as "10.6.0".
  [[nodiscard]] std::string supportSystemMinString() const;

  /// Shows an alert that says why the system is not supported, and returns when the user has
  /// dismissed it. Does nothing for a supported system.
  void showSystemNotSpecifiedAlert(const Window& parent, SystemSupport type) const;

  // hand_off.cpp: the files that hand the choices to the installer package.

  /// The medium's vendor name without its spaces; empty when the medium names no vendor.
  [[nodiscard]] static std::string setVenderName();

  /// Return the paths of the package-options file, which tells the package what else to install,
  /// and of the model file, which names the device's model and connection. Each function creates
  /// the file's folder if the folder is missing, and ignores failures. InstallPKGInfoURL() makes a
  /// folder that it creates writable for every user.
  [[nodiscard]] static std::string InstallPKGInfoURL();
  [[nodiscard]] static std::string instmodelPlistURL();

  /// Builds and writes the package-options file. Ignores failures.
  static void copyCDInfo();

  /// Returns the model file's contents for a device that is connected by cable: USB or Ethernet.
  [[nodiscard]] static Dictionary instmodelPlistNotWiFi(const std::string& model);

  /// Returns the model file's contents for a wireless device with the KSDevice record `property`.
  /// When there is no record, when the record lacks a name or an address, or when the medium names
  /// no service type, returns instmodelPlistNotWiFi() for `model`, or for an empty name when
  /// `model` is nothing.
  [[nodiscard]] static Dictionary instmodelPlistWiFi(const std::optional<std::string>& model,
                                                     const std::optional<Dictionary>& property);

  // launching.cpp: starting the package, the set-up tool and the support page.

  /// Writes the package-options file and opens the package. Returns false when the medium has no
  /// package for the system, or when the package cannot be opened.
  bool launchPackage();

  /// Terminates the application after one second, which gives the package time to open.
  void quitMe();

  /// Hide the application, run the wireless set-up tool and act on its exit status. Both functions
  /// return before the tool starts. launchWLANToolAutomatically() is for a search that found no
  /// device. Only after this function can the tool send the user back to the connection page.
  void launchWLANToolAutomatically();
  void launchWLANToolManually();

  /// Returns the URL of the support page for this medium and the user's language and country;
  /// nothing when the URL would be invalid, for example because the medium's series code contains a
  /// space.
  [[nodiscard]] static std::optional<std::string> FAQ_URL();

  /// Opens `url` in the user's browser. Does nothing without a URL.
  static void openURL(const std::optional<std::string>& url);

  // search_wait.cpp: the wait for the device search.

  /// Waits in a modal loop for kMostPauses pauses of length `pause`. If the chooser lists a device
  /// at the end of a pause, the wait ends there. Afterwards ends the search. During the wait,
  /// `page`, unless it is null, shows its waiting state, and the user can neither click a button
  /// nor close the window.
  void showProgress(const std::shared_ptr<Page>& page, std::chrono::seconds pause);

  /// Sleeps for kMostPauses pauses of length `pause`. Stops early if a device is listed at the end
  /// of a pause, and when the application terminates. Afterwards ends the modal loop. Must not be
  /// called on the main thread.
  void waitDeviceSearchTask(std::chrono::seconds pause) const;

  /// Waits as showProgress() does, with the chooser as the page. Afterwards enables Next if a
  /// device is listed; otherwise disables Next and says in a sheet that no device was found.
  void showProgressAtChooseDeviceView(std::chrono::seconds pause);

  /// Calls showProgressAtChooseDeviceView() with the pause that the notification carries under
  /// kWaitTime. If it carries none, the pauses have length 0.
  void showProgressAtChooseDeviceViewByRefresh(const Notification& notification);

  /// Tells the user in a sheet that no device was found.
  void showListAlertSheet();

  /// Opens the support page if `returnCode` is kAlertOtherReturn, which stands for the sheet's
  /// second button.
  void didEndCloseSheet(int returnCode);

 private:
  [[nodiscard]] static std::vector<std::string> allContainedModels();

  /// The chooser, or null when its interface file was not usable.
  [[nodiscard]] ChooseDeviceView* chooser() const;

  /// The number of devices that the chooser lists. Callable from any thread.
  [[nodiscard]] std::size_t listedDevices() const;

  /// Returns the page shown if it is a PageClass, otherwise null.
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

  /// Ends the wizard: writes `modelFile`, if there is one, opens the package and quits.
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
  std::optional<std::string> mChoosedModel;  ///< nothing until the user chooses from the model list
  std::uint32_t mContainedModelCount = 0;
  /// Whether the wizard itself has started the set-up tool, and the tool has not sent the user
  /// back.
  bool mIsWLANTool = false;
  std::shared_ptr<Page> mChooseDeviceViewController;
  std::shared_ptr<Page> mShownPage;  ///< the page whose view is in `mainView`
};

}  // namespace onramp

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

/// Who started the wireless set-up tool: the wizard itself, after an empty search, or the user.
enum class ToolStart { kAutomatic, kManual };

/// The wizard's only controller. It owns the state, decides which page is shown and hands the
/// user's choices to the installer package. Each group of operations has its own source file. Main
/// thread only, except for waitDeviceSearchTask().
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

  /// Checks the system's version. A supported system loses the hand-off files of earlier runs; any
  /// other gets an alert, and the application terminates.
  void applicationWillFinishLaunching() override;

  /// Shows the first page, or opens the package and quits when no model on the medium is wireless.
  void applicationDidFinishLaunching() override;
  [[nodiscard]] bool applicationShouldTerminateAfterLastWindowClosed() override { return true; }

  /// False while a search wait runs.
  [[nodiscard]] bool windowShouldClose(const Window& closing) override;

  /// Asks the application to terminate.
  void close();

  // connection_types.cpp: what the medium's models have in common.

  /// Whether any of the models connects by wireless network.
  [[nodiscard]] static bool isSupportWiFi(const std::vector<std::string>& models);

  /// The type for these two connections.
  [[nodiscard]] static ConnectionType isIFType(bool usb, bool ethernet);

  /// The type of the model with that name; kNeither without a name.
  [[nodiscard]] static ConnectionType isIFType(const std::optional<std::string>& model);

  /// The type that all of the models share; kNeither when any two differ, or when there are none.
  [[nodiscard]] static ConnectionType checkIF(const std::vector<std::string>& models);

  // navigation.cpp: pages and buttons.

  /// Loads the page from the interface file `name`. Null when the file is missing or holds no view.
  [[nodiscard]] std::shared_ptr<Page> loadView(const std::string& name);

  /// Removes the page shown, then shows `page`, or, when that is null, a new page loaded from the
  /// interface file `name`. The window stays empty when that page cannot be loaded.
  void replaceMainView(const std::string& name, std::shared_ptr<Page> page);

  /// Shows a new model list, or a new connection page for `type`. The latter also tells the chooser
  /// which models to look for: the chosen one, or all of the medium's.
  void showModelListView();
  void showConnectionTypeView(ConnectionType type);

  /// What it does depends on the page shown. Chooser: searches again. Connection page, unless the
  /// wizard has started the set-up tool: shows the chooser with what the search listed, or starts
  /// the tool when nothing was listed. Otherwise: shows the chooser and searches.
  void showChooseDeviceView();

  /// Stretches the image over the window's background. Nothing changes without an image.
  void setBackGroundView(const std::optional<Image>& image);

  /// Set up the buttons for a page: which are visible, and their titles. Next is always visible. A
  /// page with a way back has Cancel and Back beside it, any other has Cancel. The model list has
  /// no way back, the connection page has one when a model was chosen, and the chooser unless the
  /// wizard has started the set-up tool. Whether a button is enabled does not change.
  void setModelListViewButton();
  void setConnentionTypeViewButton();
  void setChooseDeviceViewButton();

  /// Each sets the text that a button's title is bound to, `titleKey`, to the localized "Cancel",
  /// "Back" or "Next".
  void setCancelButton(std::string_view titleKey);
  void setBackButton(std::string_view titleKey);
  void setNextButton(std::string_view titleKey);

  void performAction(std::string_view action) override;

  // The buttons' actions. Next is the rightmost button, Back or Cancel the one to its left; the
  // other two always quit, and so does every button while no page is shown.
  void rightMostButtonClicked();
  void rightButtonClicked();
  void leftButtonClicked();
  void leftMostButtonClicked();

  // system_check.cpp: does the medium support the running system?

  /// The components of the running system's version; empty when it is unknown.
  [[nodiscard]] static std::vector<std::string> getSystemVersion();

  /// Compare the running system with the medium's maximum and minimum. Components that the system's
  /// version lacks count as 0. All bounds are inclusive except the maximum's bug-fix release, which
  /// is the first one that is not supported; an "x" there admits every bug-fix release.
  [[nodiscard]] SystemSupport supportedOSMaxCheck() const;
  [[nodiscard]] SystemSupport supportedOSMinCheck() const;

  /// Checks the maximum first, then the minimum, and skips a bound whose "Major" is 0.
  [[nodiscard]] SystemSupport installationCheck() const;

  /// The minimum as text, such as "10.6.0".
  [[nodiscard]] std::string supportSystemMinString() const;

  /// Shows an alert that says why the system is not supported, and returns when the user has
  /// dismissed it. Does nothing for a supported system.
  void showSystemNotSpecifiedAlert(const Window& parent, SystemSupport type) const;

  // hand_off.cpp: the files that hand the choices to the installer package.

  /// The medium's vendor name without its blanks; empty when the medium names none.
  [[nodiscard]] static std::string setVenderName();

  /// Paths of the package-options file and of the model file. Both functions create the file's
  /// folder if it is missing; a new folder for the package options is open to everyone.
  [[nodiscard]] static std::string InstallPKGInfoURL();
  [[nodiscard]] static std::string instmodelPlistURL();

  /// Builds and writes the package-options file.
  static void copyCDInfo();

  /// The model file's wired form, which also serves USB.
  [[nodiscard]] static Dictionary instmodelPlistNotWiFi(const std::string& model);

  /// The model file's wireless form for the device record `property`. The wired form for `model`
  /// when the record is null or lacks a name or an address, or when the medium names no service
  /// type.
  [[nodiscard]] static Dictionary instmodelPlistWiFi(const std::optional<std::string>& model,
                                                     const std::optional<Dictionary>& property);

  // launching.cpp: the package, the set-up tool, the support page.

  /// Writes the package-options file and opens the package; false when it could not be opened.
  bool launchPackage();

  /// Terminates the application after one second, which leaves the package time to open.
  void quitMe();

  /// Hide the application, run the wireless set-up tool and act on its exit status. They return
  /// before the tool starts. The first is for a search that found nothing: only then may the tool
  /// lead back to the connection page.
  void launchWLANToolAutomatically();
  void launchWLANToolManually();

  /// The address of the support page for this medium and the user's language and country; nothing
  /// when the medium's series code makes the address invalid.
  [[nodiscard]] static std::optional<std::string> FAQ_URL();

  /// Opens `url` in the user's browser; does nothing without one.
  static void openURL(const std::optional<std::string>& url);

  // search_wait.cpp: the wait for the device search.

  /// Waits in a modal loop until the chooser lists a device, for at most kMostPauses pauses, and
  /// then ends the search. Meanwhile `page` shows its waiting state, and the user can neither click
  /// a button nor close the window.
  void showProgress(const std::shared_ptr<Page>& page, std::chrono::seconds pause);

  /// Makes the wait's pauses off the main thread: stops early once a device is listed, then ends
  /// the modal loop.
  void waitDeviceSearchTask(std::chrono::seconds pause) const;

  /// Waits as showProgress() does, with the chooser as the page. When no device is listed, says so
  /// in a sheet and disables Next.
  void showProgressAtChooseDeviceView(std::chrono::seconds pause);

  /// The same with the pause that the notification carries under kWaitTime; without one, a wait of
  /// no length.
  void showProgressAtChooseDeviceViewByRefresh(const Notification& notification);

  /// Tells the user in a sheet that no device was found.
  void showListAlertSheet();

  /// Opens the support page when the sheet's second button ended it (kAlertOtherReturn).
  void didEndCloseSheet(int returnCode);

 private:
  [[nodiscard]] static std::vector<std::string> allContainedModels();

  /// The chooser page, or null when its interface file was not usable.
  [[nodiscard]] ChooseDeviceView* chooser() const;

  /// The number of devices that the chooser lists. Callable from any thread.
  [[nodiscard]] std::size_t listedDevices() const;

  /// The page shown if it is of that class, otherwise null.
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
  void setWaiting(Page* page, bool waiting);
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
  std::optional<std::string> mChoosedModel;  ///< nothing as well when the model list was skipped
  std::uint32_t mContainedModelCount = 0;
  bool mIsWLANTool = false;  ///< the wizard itself has started the set-up tool
  std::shared_ptr<Page> mChooseDeviceViewController;
  std::shared_ptr<Page> mShownPage;  ///< whose view is the one in `mainView`
};

}  // namespace onramp

#pragma once

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

/// The wizard's one controller: it owns the state, decides which page is shown and hands the
/// choices over. Each group of operations has a source file of its own. Main thread only, but for
/// waitDeviceSearchTask().
class OnrampOSXAppDelegate final : public ApplicationDelegate {
 public:
  OnrampOSXAppDelegate();
  OnrampOSXAppDelegate(const OnrampOSXAppDelegate&) = delete;
  OnrampOSXAppDelegate& operator=(const OnrampOSXAppDelegate&) = delete;
  ~OnrampOSXAppDelegate() override;

  // start_up.cpp: start, end and the choice of the first page.
  void setOutlets(const Interface& mainInterface) override;
  void awakeFromNib() override;
  void applicationWillFinishLaunching() override;
  void applicationDidFinishLaunching() override;
  [[nodiscard]] bool applicationShouldTerminateAfterLastWindowClosed() override { return true; }
  [[nodiscard]] bool windowShouldClose(const Window& closing) override;

  /// Asks the application to terminate.
  void close();

  // connection_types.cpp: what the medium's models have in common.

  /// Whether any of the models connects by wireless network.
  [[nodiscard]] static bool isSupportWiFi(const std::vector<std::string>& models);
  [[nodiscard]] static ConnectionType isIFType(bool usb, bool ethernet);
  [[nodiscard]] static ConnectionType isIFType(const std::optional<std::string>& model);

  /// The type that all of the models share; kNeither when any two differ.
  [[nodiscard]] static ConnectionType checkIF(const std::vector<std::string>& models);

  // navigation.cpp: pages and buttons.

  /// Null when the interface file is missing or holds no view.
  [[nodiscard]] std::shared_ptr<Page> loadView(const std::string& name);

  /// Shows `page`, or when that is null a new page loaded by `name`; the old one goes first.
  void replaceMainView(const std::string& name, std::shared_ptr<Page> page);
  void showModelListView();
  void showConnectionTypeView(ConnectionType type);

  /// Shows the chooser and searches, as the page shown asks for it; after a search from the
  /// connection page that found nothing, starts the set-up tool instead.
  void showChooseDeviceView();
  void setBackGroundView(const std::optional<Image>& image);
  void setModelListViewButton();
  void setConnentionTypeViewButton();
  void setChooseDeviceViewButton();

  /// Each puts its localized title under `titleKey`.
  void setCancelButton(std::string_view titleKey);
  void setBackButton(std::string_view titleKey);
  void setNextButton(std::string_view titleKey);

  void performAction(std::string_view action) override;
  void rightMostButtonClicked();
  void rightButtonClicked();
  void leftButtonClicked();
  void leftMostButtonClicked();

  // system_check.cpp: is the running system one that the medium supports?

  /// The components of the running system's version; empty when it is unknown.
  [[nodiscard]] static std::vector<std::string> getSystemVersion();
  [[nodiscard]] SystemSupport supportedOSMaxCheck() const;
  [[nodiscard]] SystemSupport supportedOSMinCheck() const;
  [[nodiscard]] SystemSupport installationCheck() const;
  [[nodiscard]] std::string supportSystemMinString() const;

  /// Tells the user why the system is not supported, and returns when they have read it.
  void showSystemNotSpecifiedAlert(const Window& parent, SystemSupport type) const;

  // hand_off.cpp: the files that hand the choices to the installer package.

  /// The medium's vendor name without its blanks; empty when the medium names none.
  [[nodiscard]] static std::string setVenderName();

  /// Where the two files go. Both create the folder that is to hold the file.
  [[nodiscard]] static std::string InstallPKGInfoURL();
  [[nodiscard]] static std::string instmodelPlistURL();

  /// Builds and writes the package-options file.
  static void copyCDInfo();
  [[nodiscard]] static Dictionary instmodelPlistNotWiFi(const std::string& model);

  /// The wireless form for the device record `property`; the wired form when the record is null or
  /// lacks what the installer needs.
  [[nodiscard]] static Dictionary instmodelPlistWiFi(const std::optional<std::string>& model,
                                                     const std::optional<Dictionary>& property);

  // launching.cpp: the package, the set-up tool, the support page.

  /// Writes the package-options file and opens the package; false when it could not be opened.
  bool launchPackage();

  /// Terminates the application in a second, which leaves the package time to open.
  void quitMe();
  void launchWLANToolAutomatically();
  void launchWLANToolManually();

  /// The support page for this medium and the user's language and country; nothing when the
  /// medium's series code makes no valid address.
  [[nodiscard]] static std::optional<std::string> FAQ_URL();
  static void openURL(const std::optional<std::string>& url);

  // search_wait.cpp: the wait for the device search.

  /// Waits modally, five pauses of `seconds` at the most, until the chooser lists a device.
  void showProgress(const std::shared_ptr<Page>& page, std::uint32_t seconds);

  /// The wait's pauses; runs off the main thread and ends the modal loop.
  void waitDeviceSearchTask(std::uint32_t seconds) const;
  void showProgressAtChooseDeviceView(std::uint32_t seconds);
  void showProgressAtChooseDeviceViewByRefresh(const Notification& notification);
  void showListAlertSheet();
  void didEndCloseSheet(int returnCode);

 private:
  [[nodiscard]] static std::vector<std::string> allContainedModels();

  /// The chooser page, or null when its interface file was not usable.
  [[nodiscard]] ChooseDeviceView* chooser() const;
  [[nodiscard]] std::size_t listedDevices() const;

  /// The page shown if it is of that class, else null.
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

  void launchWLANTool(ToolStart start);
  void performTimerQuitMe();
  void performLaunchWLANTool(ToolStart start);
  void setWaiting(const std::shared_ptr<Page>& page, bool waiting);

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
  std::optional<std::string> mChoosedModel;
  std::uint32_t mContainedModelCount = 0;
  bool mIsWLANTool = false;
  std::shared_ptr<Page> mChooseDeviceViewController;
  std::shared_ptr<Page> mShownPage;  ///< whose view is the one in `mainView`
};

}  // namespace onramp

#include "app/OnrampOSXAppDelegate.h"
#include "media/CommonMessage.h"
#include "media/KSOROSXCD.h"
#include "media/KSOROSXModel.h"
#include "pages/ChooseDeviceView.h"
#include "platform/bundle.h"
#include "platform/property_list.h"

namespace onramp {

namespace {

struct RetitledItem {
  const char* title;
  const char* key;
};

// The misspelling in "APP_MENU_HIDEOHTERS" must stay, because the message tables on the media
// contain it, too.
constexpr RetitledItem kApplicationMenuItems[] = {{"About", "APP_MENU_ABOUT"},
                                                  {"Hide", "APP_MENU_HIDE"},
                                                  {"Hide Others", "APP_MENU_HIDEOHTERS"},
                                                  {"Show All", "APP_MENU_SHOWALL"},
                                                  {"Quit", "APP_MENU_QUIT"}};

void retitleApplicationMenu() {
  const Menu menu = mainMenu();
  const Menu applicationMenu = menu.itemWithTitle("Onramp OSX").submenu();
  for (const RetitledItem& item : kApplicationMenuItems) {
    applicationMenu.itemWithTitle(item.title).setTitle(localized(item.key, item.title));
  }
  setMainMenu(menu);
}

}  // namespace

OnrampOSXAppDelegate::OnrampOSXAppDelegate()
    : mKSCD(KSOROSXCD::initWithCDInfo()),
      mChooseDeviceViewController(loadView("ChooseDeviceView")) {
  NotificationCenter& center = NotificationCenter::defaultCenter();
  center.addObserver(this, kLaunchWLANToolNotification,
                     [this](const Notification&) { launchWLANToolManually(); });
  center.addObserver(this, kDeviceWaitNotification, [this](const Notification& notification) {
    showProgressAtChooseDeviceViewByRefresh(notification);
  });
}

OnrampOSXAppDelegate::~OnrampOSXAppDelegate() {
  NotificationCenter::defaultCenter().removeObserver(this);
  if (ChooseDeviceView* const search = chooser()) search->stopBrowsing();
}

void OnrampOSXAppDelegate::setOutlets(const Interface& mainInterface) {
  window = mainInterface.outlet<Window>("window");
  mainView = mainInterface.outlet<View>("mainView");
  leftMostButton = mainInterface.outlet<Button>("leftMostButton");
  leftButton = mainInterface.outlet<Button>("leftButton");
  rightMostButton = mainInterface.outlet<Button>("rightMostButton");
  rightButton = mainInterface.outlet<Button>("rightButton");
  mBackGroundView = mainInterface.outlet<ImageView>("mBackGroundView");
}

void OnrampOSXAppDelegate::awakeFromNib() {
  window.setShowsResizeIndicator(false);
  window.center();
  canWindowClose = true;
  boundTexts().setValueForKey(Bundle::main().infoString("CFBundleName").value_or(""),
                              "windowTitle");
  setBackGroundView(Image::named("Background.png"));
  retitleApplicationMenu();
}

void OnrampOSXAppDelegate::applicationWillFinishLaunching() {
  const SystemSupport support = installationCheck();
  if (support != SystemSupport::kSupported) {
    window.close();
    showSystemNotSpecifiedAlert(window, support);
    terminateApplication();
    return;
  }
  // The package must not mistake files from an earlier run for this run's choices.
  removeDictionary(instmodelPlistURL());
  removeDictionary(InstallPKGInfoURL());
}

void OnrampOSXAppDelegate::applicationDidFinishLaunching() {
  const std::vector<std::string> models = allContainedModels();
  mContainedModelCount = static_cast<std::uint32_t>(models.size());
  switch (firstPage(models, KSOROSXModel::modelInfo())) {
    case FirstPage::kNone:
      handOverAndQuit(std::nullopt);
      return;
    case FirstPage::kConnectionType:
      showConnectionTypeView(checkIF(models));
      setConnentionTypeViewButton();
      break;
    case FirstPage::kModelList:
      showModelListView();
      setModelListViewButton();
      break;
  }
  window.makeKeyAndOrderFront();
}

bool OnrampOSXAppDelegate::windowShouldClose(const Window&) {
  return canWindowClose;
}

void OnrampOSXAppDelegate::close() {
  terminateApplication();
}

std::vector<std::string> OnrampOSXAppDelegate::allContainedModels() {
  return containedModels(KSOROSXCD::initWithCDInfo());
}

}  // namespace onramp

#include <utility>

#include "app/OnrampOSXAppDelegate.h"
#include "app/search_wait.h"
#include "media/CommonMessage.h"
#include "media/KSOROSXModel.h"
#include "pages/ChooseDeviceView.h"
#include "pages/ModelListView.h"

namespace onramp {

std::shared_ptr<Page> OnrampOSXAppDelegate::loadView(const std::string& name) {
  return loadPage(name, *this);
}

void OnrampOSXAppDelegate::replaceMainView(const std::string& name, std::shared_ptr<Page> page) {
  for (View shown = mainView.firstSubview(); shown; shown = mainView.firstSubview()) {
    shown.removeFromSuperview();
  }
  mShownPage = page ? std::move(page) : loadView(name);
  if (mShownPage) mainView.addSubview(mShownPage->view());
}

void OnrampOSXAppDelegate::showModelListView() {
  replaceMainView("ModelListView", nullptr);
}

void OnrampOSXAppDelegate::showConnectionTypeView(ConnectionType type) {
  if (ChooseDeviceView* const search = chooser()) {
    search->setSearchModelList(mChoosedModel ? std::vector{*mChoosedModel} : allContainedModels());
  }
  replaceMainView("ConnectionTypeView", nullptr);
  if (auto* const page = shownPage<ConnectionTypeView>()) page->setConnectionType(type);
}

void OnrampOSXAppDelegate::showChooseDeviceView() {
  if (shownPage<ChooseDeviceView>()) {
    searchOnChooser();
  } else if (shownPage<ConnectionTypeView>() && !mIsWLANTool) {
    if (listedDevices() == 0) {
      mIsWLANTool = true;
      launchWLANToolAutomatically();
    } else {
      replaceMainView("ChooseDeviceView", mChooseDeviceViewController);
    }
  } else {
    replaceMainView("ChooseDeviceView", mChooseDeviceViewController);
    searchOnChooser();
  }
}

void OnrampOSXAppDelegate::searchOnChooser() {
  if (ChooseDeviceView* const search = chooser()) search->startBrowsing();
  showProgressAtChooseDeviceView(kChooserSearchPause);
}

void OnrampOSXAppDelegate::setBackGroundView(const std::optional<Image>& image) {
  if (!image) return;
  mBackGroundView.setImageScaling(ImageScaling::kAxesIndependently);
  mBackGroundView.setImage(*image);
}

void OnrampOSXAppDelegate::setButton(std::string_view titleKey, const std::string& title) {
  boundTexts().setValueForKey(localized(title), titleKey);
}

void OnrampOSXAppDelegate::setCancelButton(std::string_view titleKey) {
  setButton(titleKey, "BTN_CANCEL");
}

void OnrampOSXAppDelegate::setBackButton(std::string_view titleKey) {
  setButton(titleKey, "BTN_BACK");
}

void OnrampOSXAppDelegate::setNextButton(std::string_view titleKey) {
  setButton(titleKey, "BTN_NEXT");
}

void OnrampOSXAppDelegate::setBackAndCancel(bool canGoBack) {
  leftMostButton.setHidden(true);
  leftButton.setHidden(!canGoBack);
  rightButton.setHidden(false);
  rightMostButton.setHidden(false);
  setNextButton("rightMostButtonTitle");
  if (canGoBack) {
    setCancelButton("leftButtonTitle");
    setBackButton("rightButtonTitle");
  } else {
    setCancelButton("rightButtonTitle");
  }
}

void OnrampOSXAppDelegate::setModelListViewButton() {
  setBackAndCancel(false);
}

void OnrampOSXAppDelegate::setConnentionTypeViewButton() {
  setBackAndCancel(mChoosedModel.has_value());
}

void OnrampOSXAppDelegate::setChooseDeviceViewButton() {
  setBackAndCancel(!mIsWLANTool);
}

void OnrampOSXAppDelegate::performAction(std::string_view action) {
  struct Action {
    std::string_view name;
    void (OnrampOSXAppDelegate::*perform)();
  };
  static constexpr Action kActions[] = {
      {"rightMostButtonClicked", &OnrampOSXAppDelegate::rightMostButtonClicked},
      {"rightButtonClicked", &OnrampOSXAppDelegate::rightButtonClicked},
      {"leftButtonClicked", &OnrampOSXAppDelegate::leftButtonClicked},
      {"leftMostButtonClicked", &OnrampOSXAppDelegate::leftMostButtonClicked}};
  for (const Action& known : kActions) {
    if (known.name == action) (this->*known.perform)();
  }
}

void OnrampOSXAppDelegate::rightMostButtonClicked() {
  if (const auto* const models = shownPage<ModelListView>()) {
    nextFromModelList(*models);
  } else if (const auto* const connections = shownPage<ConnectionTypeView>()) {
    nextFromConnectionType(*connections);
  } else if (const auto* const devices = shownPage<ChooseDeviceView>()) {
    nextFromChooser(*devices);
  } else {
    close();
  }
}

void OnrampOSXAppDelegate::rightButtonClicked() {
  if (shownPage<ConnectionTypeView>() && mChoosedModel) {
    backToModelList();
  } else if (shownPage<ChooseDeviceView>() && !mIsWLANTool) {
    backToConnectionType();
  } else {
    close();
  }
}

void OnrampOSXAppDelegate::leftButtonClicked() {
  close();
}

void OnrampOSXAppDelegate::leftMostButtonClicked() {
  close();
}

void OnrampOSXAppDelegate::nextFromModelList(const ModelListView& page) {
  mChoosedModel = page.choosedModelName();
  const Dictionary model = KSOROSXModel::initWithName(mChoosedModel);
  if (model.boolean(KSOROSXModel::kSupportWiFi).value_or(false)) {
    showConnectionTypeView(isIFType(mChoosedModel));
    setConnentionTypeViewButton();
    return;
  }
  handOverAndQuit(instmodelPlistNotWiFi(mChoosedModel.value_or("")));
}

void OnrampOSXAppDelegate::nextFromConnectionType(const ConnectionTypeView& page) {
  if (page.chooseDeviceType() != ConnectionTypeView::kWirelessRow) {
    handOverAndQuit(mChoosedModel ? std::optional(instmodelPlistNotWiFi(*mChoosedModel))
                                  : std::nullopt);
    return;
  }
  if (ChooseDeviceView* const search = chooser()) search->startBrowsing();
  const std::shared_ptr<Page> waitingPage = mShownPage;
  showProgress(waitingPage, kFirstSearchPause);
  setChooseDeviceViewButton();
  showChooseDeviceView();
}

void OnrampOSXAppDelegate::nextFromChooser(const ChooseDeviceView& page) {
  const std::optional<Dictionary> entry = page.choosedDevice();
  const auto device = entry ? entry->dictionary(ChooseDeviceView::kKSDevice) : std::nullopt;
  handOverAndQuit(instmodelPlistWiFi(mChoosedModel, device));
}

void OnrampOSXAppDelegate::backToModelList() {
  showModelListView();
  setModelListViewButton();
  if (auto* const page = shownPage<ModelListView>()) page->setChoosedModel(*mChoosedModel);
  window.orderFront();
}

void OnrampOSXAppDelegate::backToConnectionType() {
  rightMostButton.setEnabled(true);
  showConnectionTypeView(mChoosedModel ? isIFType(mChoosedModel) : checkIF(allContainedModels()));
  setConnentionTypeViewButton();
}

ChooseDeviceView* OnrampOSXAppDelegate::chooser() const {
  return dynamic_cast<ChooseDeviceView*>(mChooseDeviceViewController.get());
}

std::size_t OnrampOSXAppDelegate::listedDevices() const {
  const ChooseDeviceView* const page = chooser();
  return page ? page->deviceArrayControllerCnt() : 0;
}

}  // namespace onramp

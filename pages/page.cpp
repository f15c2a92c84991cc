#include "pages/page.h"

#include <utility>

#include "pages/ChooseDeviceView.h"
#include "pages/ConnectionTypeView.h"
#include "pages/ModelListView.h"

namespace onramp {

std::shared_ptr<Page> loadPage(const std::string& name, InterfaceOwner& owner) {
  std::unique_ptr<Interface> interface = Interface::load(name, owner);
  if (!interface || !interface->view()) return nullptr;

  const std::string viewClass = interface->viewClass();
  if (viewClass == "ModelListView") return std::make_shared<ModelListView>(std::move(interface));
  if (viewClass == "ConnectionTypeView") {
    return std::make_shared<ConnectionTypeView>(std::move(interface));
  }
  if (viewClass == "ChooseDeviceView") {
    return std::make_shared<ChooseDeviceView>(std::move(interface));
  }
  return std::make_shared<Page>(std::move(interface));
}

void showWaiting(const ProgressIndicator& progress, const TextField& text, bool on) {
  if (on) progress.startAnimation();
  progress.setHidden(!on);
  if (!on) progress.stopAnimation();
  text.setHidden(!on);
}

}  // namespace onramp

#include "app/OnrampOSXAppDelegate.h"
#include "media/KSOROSXModel.h"

namespace onramp {

bool OnrampOSXAppDelegate::isSupportWiFi(const std::vector<std::string>& models) {
  return anySupportsWiFi(models, KSOROSXModel::modelInfo());
}

ConnectionType OnrampOSXAppDelegate::isIFType(bool usb, bool ethernet) {
  return connectionType(usb, ethernet);
}

ConnectionType OnrampOSXAppDelegate::isIFType(const std::optional<std::string>& model) {
  return connectionType(KSOROSXModel::initWithName(model));
}

ConnectionType OnrampOSXAppDelegate::checkIF(const std::vector<std::string>& models) {
  return sharedConnectionType(models, KSOROSXModel::modelInfo());
}

}  // namespace onramp

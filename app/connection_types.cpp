#include "app/OnrampOSXAppDelegate.h"
#include "media/KSOROSXModel.h"

namespace onramp {

namespace {

// A flag that is missing from the record counts as false.
bool supports(const Dictionary& model, std::string_view connection) {
  return model.boolean(connection).value_or(false);
}

ConnectionType typeOf(const Dictionary& model) {
  return OnrampOSXAppDelegate::isIFType(supports(model, KSOROSXModel::kSupportUSB),
                                        supports(model, KSOROSXModel::kSupportEthernet));
}

}  // namespace

bool OnrampOSXAppDelegate::isSupportWiFi(const std::vector<std::string>& models) {
  const std::optional<Dictionary> info = KSOROSXModel::modelInfo();
  for (const std::string& model : models) {
    if (supports(KSOROSXModel::initWithName(model, info), KSOROSXModel::kSupportWiFi)) return true;
  }
  return false;
}

ConnectionType OnrampOSXAppDelegate::isIFType(bool usb, bool ethernet) {
  if (usb) return ethernet ? ConnectionType::kUSBAndEthernet : ConnectionType::kUSB;
  return ethernet ? ConnectionType::kEthernet : ConnectionType::kNeither;
}

ConnectionType OnrampOSXAppDelegate::isIFType(const std::optional<std::string>& model) {
  return typeOf(KSOROSXModel::initWithName(model));
}

ConnectionType OnrampOSXAppDelegate::checkIF(const std::vector<std::string>& models) {
  if (models.empty()) return ConnectionType::kNeither;
  const std::optional<Dictionary> info = KSOROSXModel::modelInfo();
  const ConnectionType first = typeOf(KSOROSXModel::initWithName(models.front(), info));
  for (const std::string& model : models) {
    // Two models have the same type exactly when they agree on both connections.
    if (typeOf(KSOROSXModel::initWithName(model, info)) != first) return ConnectionType::kNeither;
  }
  return first;
}

}  // namespace onramp

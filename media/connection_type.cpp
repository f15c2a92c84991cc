#include "media/connection_type.h"

#include <algorithm>
#include <string_view>

#include "media/KSOROSXModel.h"

namespace onramp {

namespace {

bool supports(const Dictionary& model, std::string_view connection) {
  return model.boolean(connection).value_or(false);
}

}  // namespace

ConnectionType connectionType(bool usb, bool ethernet) {
  if (usb) return ethernet ? ConnectionType::kUSBAndEthernet : ConnectionType::kUSB;
  return ethernet ? ConnectionType::kEthernet : ConnectionType::kNeither;
}

ConnectionType connectionType(const Dictionary& model) {
  return connectionType(supports(model, KSOROSXModel::kSupportUSB),
                        supports(model, KSOROSXModel::kSupportEthernet));
}

ConnectionType sharedConnectionType(const std::vector<std::string>& models,
                                    const std::optional<Dictionary>& modelInfo) {
  if (models.empty()) return ConnectionType::kNeither;
  const auto typeOf = [&](const std::string& model) {
    return connectionType(KSOROSXModel::initWithName(model, modelInfo));
  };
  const ConnectionType first = typeOf(models.front());
  const bool agree = std::all_of(models.begin(), models.end(),
                                 [&](const std::string& model) { return typeOf(model) == first; });
  return agree ? first : ConnectionType::kNeither;
}

bool anySupportsWiFi(const std::vector<std::string>& models,
                     const std::optional<Dictionary>& modelInfo) {
  return std::any_of(models.begin(), models.end(), [&](const std::string& model) {
    return supports(KSOROSXModel::initWithName(model, modelInfo), KSOROSXModel::kSupportWiFi);
  });
}

FirstPage firstPage(const std::vector<std::string>& models,
                    const std::optional<Dictionary>& modelInfo) {
  if (!anySupportsWiFi(models, modelInfo)) return FirstPage::kNone;
  return sharedConnectionType(models, modelInfo) == ConnectionType::kNeither
             ? FirstPage::kModelList
             : FirstPage::kConnectionType;
}

}  // namespace onramp

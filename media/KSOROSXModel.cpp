#include "media/KSOROSXModel.h"

#include <vector>

#include "media/medium.h"

namespace onramp {

std::optional<Dictionary> KSOROSXModel::modelInfo() {
  return medium::loadNamedDictionary(medium::loadResourceDictionary(), medium::kModelInfo);
}

Dictionary KSOROSXModel::initWithName(const std::optional<std::string>& name) {
  return initWithName(name, modelInfo());
}

Dictionary KSOROSXModel::initWithName(const std::optional<std::string>& name,
                                      const std::optional<Dictionary>& modelInfoPlist) {
  if (!name) return {};
  const auto models = modelInfoPlist ? modelInfoPlist->dictionary("Model") : std::nullopt;
  const auto entry = models ? models->dictionary(*name) : std::nullopt;

  std::vector<Dictionary::Pair> pairs{{kName, *name}};
  Value identifier = "";
  Dictionary interfaces;
  if (entry) {
    const Value* const kscid = entry->find("KSCID");
    if (!kscid) return Dictionary(std::move(pairs));
    identifier = *kscid;
    interfaces = entry->dictionary("Interfaces").value_or(Dictionary());
  }
  pairs.emplace_back(kKSCModelID, identifier);
  pairs.emplace_back(kSupportUSB, interfaces.boolean("USB").value_or(true));
  pairs.emplace_back(kSupportEthernet, interfaces.boolean("WiredLAN").value_or(false));
  pairs.emplace_back(kSupportWiFi, interfaces.boolean("WirelessLAN").value_or(false));
  return Dictionary(std::move(pairs));
}

std::string KSOROSXModel::convertRelativePathToFullPath(
    const std::optional<std::string>& relativePath) {
  return medium::fullPath(relativePath);
}

}  // namespace onramp

#include "media/KSOROSXCD.h"

#include <algorithm>
#include <vector>

#include "media/medium.h"
#include "media/text_order.h"

namespace onramp {

namespace {

Array sortedModelNames(const Dictionary& info) {
  std::vector<std::string> names;
  if (const auto models = info.dictionary("ContainedModel")) {
    for (const auto& [name, unused] : *models)
      names.push_back(name);
  }
  sortIgnoringCase(names);
  return Array(std::make_move_iterator(names.begin()), std::make_move_iterator(names.end()));
}

Dictionary makeRecord(Array models, bool printer, bool scanner, std::string series,
                      std::string service) {
  return Dictionary{{std::string(KSOROSXCD::kContainedModels), std::move(models)},
                    {std::string(KSOROSXCD::kSupportPrinterPackage), printer},
                    {std::string(KSOROSXCD::kSupportScannerPackage), scanner},
                    {std::string(KSOROSXCD::kKSCSeriesCode), std::move(series)},
                    {std::string(KSOROSXCD::kBonjourServiceType), std::move(service)}};
}

}  // namespace

Dictionary KSOROSXCD::initWithCDInfo() {
  const std::optional<Dictionary> common = medium::loadResourceDictionary();
  return initWithCDInfoPlist(medium::loadNamedDictionary(common, medium::kCDInfo), common);
}

Dictionary KSOROSXCD::initWithCDInfoPlist(const std::optional<Dictionary>& info,
                                          const std::optional<Dictionary>& CDCommonInfo) {
  if (!info) return makeRecord({}, true, true, "", "");
  const Dictionary types = info->dictionary("Type").value_or(Dictionary());
  const Dictionary common = CDCommonInfo.value_or(Dictionary());
  return makeRecord(sortedModelNames(*info), types.boolean("Printer").value_or(true),
                    types.boolean("TWAIN").value_or(true),
                    info->string("KSCSeriesCode").value_or(""),
                    common.string(medium::kBonjourNetwork).value_or(""));
}

std::string KSOROSXCD::convertRelativePathToFullPath(
    const std::optional<std::string>& relativePath) {
  return medium::fullPath(relativePath);
}

std::vector<std::string> containedModels(const Dictionary& record) {
  std::vector<std::string> names;
  if (const Array* const models = record.array(KSOROSXCD::kContainedModels)) {
    names.reserve(models->size());
    for (const Value& model : *models) {
      if (const auto* name = model.as<std::string>()) names.push_back(*name);
    }
  }
  return names;
}

}  // namespace onramp

#include "bonjour/KSDevice.h"

#include <string>
#include <utility>

#include "bonjour/KSNetService.h"

namespace onramp {

namespace {

// Returns an empty string for a null service, otherwise the result of `read`, which may be nothing.
// So the record's model name is one space for a null service, but empty for a service without a
// manufacturer or model.
std::optional<std::string> textOf(const NetServiceRef& service,
                                  std::optional<std::string> (*read)(const NetServiceRef&)) {
  return service ? read(service) : "";
}

}  // namespace

Dictionary KSDevice::initWithService(const NetServiceRef& service,
                                     const std::optional<Array>& types) {
  const auto name = textOf(service, KSNetServiceGetNameSafe);
  const auto manufacturer = textOf(service, KSNetServiceCopyManufacturer);
  const auto model = textOf(service, KSNetServiceCopyModel);
  const auto note = textOf(service, KSNetServiceCopyNote);
  const auto uri = textOf(service, KSNetServiceCopyDeviceURI);

  Array addresses;
  if (auto found = KSNetServiceCopyIPv4Addresses(service)) {
    addresses.assign(std::make_move_iterator(found->begin()),
                     std::make_move_iterator(found->end()));
  }
  std::string modelName;
  if (manufacturer && model) modelName = *manufacturer + ' ' + *model;

  return Dictionary{{kDisplayName, name.value_or("")},
                    {kModelName, std::move(modelName)},
                    {kBonjourServiceType, types.value_or(Array())},
                    {kUSBManufacturer, manufacturer.value_or("")},
                    {kUSBModel, model.value_or("")},
                    {kLocation, note.value_or("")},
                    {kDeviceURI, uri.value_or("")},
                    {kIPAddressList, std::move(addresses)}};
}

}  // namespace onramp

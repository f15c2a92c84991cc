#include "bonjour/model_match.h"

#include <algorithm>

#include "bonjour/KSDevice.h"

namespace onramp {

std::string modelTextOf(const Dictionary& device) {
  return device.string(KSDevice::kUSBManufacturer).value_or("") + ' ' +
         device.string(KSDevice::kUSBModel).value_or("");
}

bool isOneOf(const std::vector<std::string>& models, const Dictionary& device) {
  return std::find(models.begin(), models.end(), modelTextOf(device)) != models.end();
}

}  // namespace onramp

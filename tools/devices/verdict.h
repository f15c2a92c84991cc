#pragma once

#include <functional>
#include <string>
#include <vector>

#include "tools/devices/device.h"

namespace onramp::devices {

/// The reason why a device is, or is not, in the wizard's list. If it is not, the verdict names the
/// first condition that the device fails. Notes and problems of the network have the same form.
struct Verdict {
  std::string id;  ///< such as "on-cable"; programs rely on it
  bool isListed = false;
  std::string why{};     ///< a phrase without a full stop
  std::string remedy{};  ///< what to do; can be empty
};

/// Returns whether the wizard would ask the device which interface it uses. The wizard asks a
/// device that is resolved under the medium's service type, is a wanted model, and has an IPv4
/// address.
[[nodiscard]] bool isAsked(const Device& device, const Medium& medium);

/// Returns the verdict on a device. `isLocal` returns whether an IPv4 address is in a subnet of
/// this computer.
[[nodiscard]] Verdict judge(const Device& device, const Medium& medium,
                            const std::function<bool(const std::string& address)>& isLocal);

/// Returns a note if the device's model never leads to a search, and a note if a reply of the
/// device changes the wizard's requests to later devices.
[[nodiscard]] std::vector<Verdict> notesOn(const Device& device, const Medium& medium);

}  // namespace onramp::devices

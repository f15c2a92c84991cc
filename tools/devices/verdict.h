#pragma once

#include <functional>
#include <string>
#include <vector>

#include "tools/devices/device.h"

namespace onramp::devices {

/// Why a device is or is not in the wizard's list: the first step that it fails, if any.
struct Verdict {
  std::string id;  ///< stable, for programs, such as "on-cable"
  bool isListed = false;
  std::string why{};     ///< a sentence without its full stop
  std::string remedy{};  ///< what to do about it; empty when nothing needs to be done
};

/// Whether the wizard would ask the device for its interface.
[[nodiscard]] bool isAsked(const Device& device, const Medium& medium);

/// Returns the verdict on a device from everything known about it. `isLocal` tells whether an IPv4
/// address is in a subnet of this computer.
[[nodiscard]] Verdict judge(const Device& device, const Medium& medium,
                            const std::function<bool(const std::string& address)>& isLocal);

/// What else is worth knowing about the device: its effects on other devices. The notes' ids are
/// stable, as those of verdicts are.
[[nodiscard]] std::vector<Verdict> notesOn(const Device& device, const Medium& medium);

}  // namespace onramp::devices

#pragma once

#include <optional>
#include <set>
#include <string>
#include <vector>

#include "base/value.h"
#include "tools/devices/exchange.h"

namespace onramp::devices {

/// Everything known about one announced device. A device may announce services of several types.
/// Services with the same name and domain belong to the same device. Times are in seconds since the
/// search began.
struct Device {
  std::string name;
  std::string domain;
  std::string type;                ///< the type of the service whose addresses are used
  std::vector<std::string> types;  ///< the types of all services that the device announces
  double found = 0;
  std::optional<double> resolved;
  std::optional<double> gone;
  Dictionary record;                ///< a KSDevice record; empty until the first resolve
  std::optional<Data> txt;          ///< the TXT record as it was received
  std::vector<std::string> ipv6;    ///< IPv6 addresses, which the wizard does not use
  std::set<std::string> sightings;  ///< where it is seen, such as "eth0 IPv4"; empty on macOS
  std::optional<Answer> answer;     ///< no value until askDevice() has returned
};

/// The parts of a medium on which the wizard's search depends.
struct Medium {
  std::string path;                          ///< as the user gave it
  std::string type;                          ///< the one service type that the wizard looks for
  std::vector<std::string> models;           ///< all models of the medium
  std::vector<std::string> wanted;           ///< the models that the wizard searches for
  bool choosesModel = false;                 ///< whether the wizard begins with the model list
  std::vector<std::string> withoutSearch{};  ///< the models whose users never reach a search
};

}  // namespace onramp::devices

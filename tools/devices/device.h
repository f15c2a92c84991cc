#pragma once

#include <optional>
#include <set>
#include <string>
#include <vector>

#include "base/value.h"
#include "tools/devices/exchange.h"

namespace onramp::devices {

/// Everything known about one announced device. Announcements of different service types belong to
/// one device if they have the same name and domain. Times are in seconds since the search began.
struct Device {
  std::string name;
  std::string domain;
  std::string type;                ///< the type whose announcement is resolved
  std::vector<std::string> types;  ///< all types under which the device is announced
  double found = 0;
  std::optional<double> resolved;
  std::optional<double> gone;
  Dictionary record;                ///< a KSDevice record; empty until the first resolve
  std::optional<Data> txt;          ///< the TXT record as it was received
  std::vector<std::string> ipv6;    ///< IPv6 addresses, which the wizard does not use
  std::set<std::string> sightings;  ///< interfaces and protocols, such as "eth0 IPv4"
  std::optional<Answer> answer;     ///< nothing when the device was not asked
};

/// What the wizard reads from the medium for its search.
struct Medium {
  std::string path;                 ///< as the user gave it
  std::string type;                 ///< the one service type that the wizard looks for
  std::vector<std::string> models;  ///< all models of the medium
  std::vector<std::string> wanted;  ///< the models that the wizard searches for
};

}  // namespace onramp::devices

#pragma once

#include <optional>
#include <set>
#include <string>
#include <vector>

#include "base/value.h"
#include "tools/devices/exchange.h"

namespace onramp::devices {

/// Everything known of one announced device: what all service types announce under one name in one
/// domain. Times are in seconds since the search began.
struct Device {
  std::string name;
  std::string domain;
  std::string type;                ///< what the fields below come from
  std::vector<std::string> types;  ///< all types that it is announced under
  double found = 0;
  std::optional<double> resolved;
  std::optional<double> gone;
  Dictionary record;                ///< a KSDevice record, once resolved
  std::optional<Data> txt;          ///< the TXT record as on the wire
  std::vector<std::string> ipv6;    ///< addresses that the wizard does not use
  std::set<std::string> sightings;  ///< where it is seen, such as "eth0 IPv4"
  std::optional<Answer> answer;     ///< absent when it was not asked
};

/// What the wizard reads from the medium for its search.
struct Medium {
  std::string path;                 ///< as the user gave it
  std::string type;                 ///< the one service type that it browses
  std::vector<std::string> models;  ///< all models of the medium
  std::vector<std::string> wanted;  ///< those that it searches for
};

}  // namespace onramp::devices

#pragma once

namespace onramp {

/// The interfaces that a model, or all models of the medium, support besides wireless.
enum class ConnectionType : unsigned char {
  kNeither = 0,  ///< neither USB nor wired Ethernet, or the models disagree
  kEthernet = 2,
  kUSB = 3,
  kUSBAndEthernet = 4,
};

}  // namespace onramp

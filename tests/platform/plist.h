#pragma once

#include <string>

namespace onramp {

/// Returns an XML property list whose root dictionary has the key "k". `value` is the XML of the
/// key's value. More keys and values may follow in `value`.
inline std::string plistWith(const std::string& value) {
  return "<plist version=\"1.0\"><dict><key>k</key>" + value + "</dict></plist>";
}

}  // namespace onramp

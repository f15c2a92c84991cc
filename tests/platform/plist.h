#pragma once

#include <string>

namespace onramp {

/// Returns an XML property list whose root dictionary has the entries `inside`.
inline std::string plist(const std::string& inside) {
  return "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
         "<!DOCTYPE plist PUBLIC \"-//Apple//DTD PLIST 1.0//EN\" "
         "\"http://www.apple.com/DTDs/PropertyList-1.0.dtd\">\n"
         "<plist version=\"1.0\"><dict>" +
         inside + "</dict></plist>\n";
}

}  // namespace onramp

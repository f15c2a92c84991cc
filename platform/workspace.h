#pragma once

#include <string>

namespace onramp {

/// Has the desktop open the file or bundle at `path` with the program made for it. Returns at once;
/// true when the desktop took the request.
bool openFile(const std::string& path);

/// Has the desktop open `url` in the user's browser. Returns at once; true when the desktop took
/// the request.
bool openURL(const std::string& url);

}  // namespace onramp

#pragma once

#include <string>

namespace onramp {

/// Asks the desktop to open the file or bundle at `path` in its default program. Does not wait for
/// that program. Returns whether the desktop accepted the request.
bool openFile(const std::string& path);

/// Asks the desktop to open `url` in the user's browser. Does not wait for the browser. Returns
/// whether the desktop accepted the request.
bool openURL(const std::string& url);

}  // namespace onramp

#pragma once

#include <string>

namespace onramp {

/// Asks the desktop to open the file or bundle at `path` in the default program for its type. Does
/// not wait for that program. Returns false when the request cannot be made or the desktop refuses
/// it at once. Later failures are not reported.
bool openFile(const std::string& path);

/// Asks the desktop to open `url` in the user's browser. Does not wait for the browser. Returns
/// false in the same cases as openFile(), and when the backend rejects the form of `url`.
bool openURL(const std::string& url);

}  // namespace onramp

#pragma once

#include <string>

#include "tools/check/finding.h"

namespace onramp::check {

/// Adds to `finding` why the wizard cannot read the file at `path`: what was found there, what was
/// expected, the mistake's line or byte, and the remedy. `isStrings` says whether the file should
/// be a strings table; otherwise it should be a property list.
void explainUnreadable(const std::string& path, bool isStrings, Finding& finding);

}  // namespace onramp::check

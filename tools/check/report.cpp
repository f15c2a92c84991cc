#include "tools/check/report.h"

#include <algorithm>

namespace onramp::check {

std::size_t Report::count(Severity severity) const {
  return static_cast<std::size_t>(
      std::count_if(findings.begin(), findings.end(),
                    [&](const Finding& finding) { return finding.severity == severity; }));
}

}  // namespace onramp::check

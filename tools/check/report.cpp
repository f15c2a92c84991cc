#include "tools/check/report.h"

#include <algorithm>

namespace onramp::check {

std::size_t Report::count(Severity severity) const {
  return static_cast<std::size_t>(
      std::count_if(findings.begin(), findings.end(),
                    [&](const Finding& finding) { return finding.severity == severity; }));
}

bool Report::hasMisspelt(std::string_view file, std::string_view key) const {
  return std::any_of(findings.begin(), findings.end(), [&](const Finding& finding) {
    return finding.id == "key-misspelt" && finding.place.file == file && finding.nearest == key;
  });
}

}  // namespace onramp::check

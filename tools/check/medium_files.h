#pragma once

#include <map>
#include <optional>
#include <string>
#include <vector>

#include "base/value.h"
#include "tools/check/report.h"
#include "tools/check/xml_lines.h"

namespace onramp::check {

/// Who names a path, and what users see when nothing usable lies there.
struct PathUse {
  Place place{};         ///< of the text that is the path
  std::string what{};    ///< such as "the medium description"
  std::string effect{};  ///< a phrase
};

/// The files of one medium, by paths relative to it. Whatever is wrong with a file goes into the
/// report once.
class MediumFiles {
 public:
  /// `root` is the medium's folder; `application` is the application's bundle in it, which paths
  /// count from, whether or not it is there.
  MediumFiles(std::string root, std::string application, Report& report);

  [[nodiscard]] const std::string& root() const { return root_; }
  [[nodiscard]] const std::string& application() const { return application_; }
  [[nodiscard]] Report& report() const { return report_; }

  /// Where the wizard looks for `relative`.
  [[nodiscard]] std::string fullPath(const std::string& relative) const;

  /// Whether something lies at `relative` as it is spelled there, inside the medium. What is wrong
  /// is reported.
  bool exists(const std::string& relative, const PathUse& use) const;

  /// The property list at `relative`; nothing, after a report, when the wizard cannot read it.
  [[nodiscard]] std::optional<Dictionary> list(const std::string& relative,
                                               const PathUse& use) const;

  /// The strings table at `relative`, likewise.
  [[nodiscard]] std::optional<Dictionary> strings(const std::string& relative,
                                                  const PathUse& use) const;

  /// The names in the folder at `relative`, sorted; none when there is no such folder.
  [[nodiscard]] std::vector<std::string> names(const std::string& relative) const;

  /// Gives the findings that name a key of an XML property list the line of that key.
  void addLines() const;

 private:
  void reportUnreadable(const std::string& relative, const PathUse& use, bool isStrings) const;

  const XMLLines& linesOf(const std::string& relative) const;

  std::string root_;
  std::string application_;
  Report& report_;
  mutable std::map<std::string, XMLLines> lines_;  ///< of the lists looked at so far
};

}  // namespace onramp::check

#pragma once

#include <map>
#include <optional>
#include <string>
#include <vector>

#include "base/value.h"
#include "tools/check/report.h"
#include "tools/check/xml_lines.h"

namespace onramp::check {

/// Where a path is named, what it is for, and what users see when it leads to nothing usable.
struct PathUse {
  Place place{};         ///< where the path is written
  std::string what{};    ///< such as "the medium description"
  std::string effect{};  ///< a phrase
};

/// The files of one medium. Relative paths start at the medium's top folder. The functions add what
/// is wrong with a file to the report.
class MediumFiles {
 public:
  /// `root` is the medium's folder. `application` is the path of the application's bundle in it,
  /// which need not exist.
  MediumFiles(std::string root, std::string application, Report& report);

  [[nodiscard]] const std::string& root() const { return root_; }
  [[nodiscard]] const std::string& application() const { return application_; }
  [[nodiscard]] Report& report() const { return report_; }

  /// Returns the path at which the wizard looks for `relative`.
  [[nodiscard]] std::string fullPath(const std::string& relative) const;

  /// Returns whether `relative` leads to a file or folder inside the medium whose name is spelled
  /// exactly so. Reports the mistake if not.
  bool exists(const std::string& relative, const PathUse& use) const;

  /// Returns the property list at `relative`. When the wizard cannot read it, reports why and
  /// returns nothing.
  [[nodiscard]] std::optional<Dictionary> list(const std::string& relative,
                                               const PathUse& use) const;

  /// Returns the strings table at `relative`. When the wizard cannot read it, reports why and
  /// returns nothing.
  [[nodiscard]] std::optional<Dictionary> strings(const std::string& relative,
                                                  const PathUse& use) const;

  /// Returns the sorted names of the entries in the folder at `relative`; none when there is no
  /// such folder.
  [[nodiscard]] std::vector<std::string> names(const std::string& relative) const;

  /// Adds the line number to each finding about a key of an XML property list.
  void addLines() const;

 private:
  void reportUnreadable(const std::string& relative, const PathUse& use, bool isStrings) const;

  const XMLLines& linesOf(const std::string& relative) const;

  std::string root_;
  std::string application_;
  Report& report_;
  mutable std::map<std::string, XMLLines> lines_;  ///< of the property lists read so far
};

}  // namespace onramp::check

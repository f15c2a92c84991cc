#pragma once

#include <map>
#include <optional>
#include <string>
#include <vector>

#include "base/value.h"
#include "tools/check/report.h"
#include "tools/check/xml_lines.h"

namespace onramp::check {

/// The use of a file or folder, for findings about it.
struct PathUse {
  Place place{};       ///< where its path is written; without a key, the wizard itself has the path
  std::string what{};  ///< what it is, such as "the medium description"
  std::string effect{};  ///< what users see when it is missing or unusable, a phrase
};

/// The files of one medium. Relative paths start at the medium's top folder. exists(), list() and
/// strings() add what is wrong with a file to the report.
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

  /// Returns whether `relative`, capitals included, is the path of a file or folder on the medium.
  /// Reports the mistake if it is not.
  bool exists(const std::string& relative, const PathUse& use) const;

  /// Returns the property list at `relative`, and reports keys that a dictionary in it has twice.
  /// When exists() fails or the wizard cannot read the list, reports why and returns nothing.
  [[nodiscard]] std::optional<Dictionary> list(const std::string& relative,
                                               const PathUse& use) const;

  /// Returns the strings table at `relative`. When exists() fails or the wizard cannot read the
  /// table, reports why and returns nothing.
  [[nodiscard]] std::optional<Dictionary> strings(const std::string& relative,
                                                  const PathUse& use) const;

  /// Returns the sorted names of the entries in the folder at `relative`; none when it cannot be
  /// read.
  [[nodiscard]] std::vector<std::string> names(const std::string& relative) const;

  /// Adds the line number, if it is known, to each finding about a key of an XML property list.
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

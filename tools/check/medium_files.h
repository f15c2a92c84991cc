#pragma once

#include <map>
#include <optional>
#include <set>
#include <string>
#include <vector>

#include "base/value.h"
#include "tools/check/report.h"
#include "tools/check/xml_lines.h"

namespace onramp::check {

/// The wizard's use of a file or folder. Findings about the file quote these strings.
struct PathUse {
  Place place{};  ///< where the path is written; without a key if the path is fixed in the wizard
  std::string what{};    ///< the file's role, such as "the medium description"
  std::string effect{};  ///< what users see when the file is missing or unusable
};

/// The files of one medium. Relative paths start at the medium's top folder. exists(), list() and
/// strings() add findings to the report, which must outlive this object.
class MediumFiles {
 public:
  /// `root` is the medium's folder. `application` is the full path of the application's bundle in
  /// that folder. The bundle need not exist.
  MediumFiles(std::string root, std::string application, Report& report);

  [[nodiscard]] const std::string& root() const { return root_; }
  [[nodiscard]] const std::string& application() const { return application_; }
  [[nodiscard]] Report& report() const { return report_; }

  /// Returns the full path at which the wizard looks for `relative`.
  [[nodiscard]] std::string fullPath(const std::string& relative) const;

  /// Returns whether the medium has a file or folder at `relative`. The comparison is
  /// case-sensitive, even on a case-insensitive file system. Reports a path that is missing or
  /// leads outside the medium, and returns false for it.
  bool exists(const std::string& relative, const PathUse& use) const;

  /// Returns the property list at `relative`. If it is an XML list, reports each key that a
  /// dictionary in it repeats. Does not look into arrays or into the value of a repeated key. When
  /// exists() returns false or the wizard cannot read the list, reports why and returns nothing.
  [[nodiscard]] std::optional<Dictionary> list(const std::string& relative,
                                               const PathUse& use) const;

  /// Returns the strings table at `relative`. When exists() returns false or the wizard cannot read
  /// the table, reports why and returns nothing.
  [[nodiscard]] std::optional<Dictionary> strings(const std::string& relative,
                                                  const PathUse& use) const;

  /// Returns the sorted names of the entries in the folder at `relative`. Returns no names when the
  /// folder cannot be read.
  [[nodiscard]] std::vector<std::string> names(const std::string& relative) const;

  /// Removes each proposal to use an existing file in place of a missing one, if the existing file
  /// turned out to be needed under its own name. Call this after all the checks.
  void withdrawUsedNames() const;

  /// Adds line numbers to the report's findings about keys of XML property lists and strings
  /// tables, where the lines are known.
  void addLines() const;

 private:
  struct Guess {
    std::size_t finding = 0;  ///< the index in the report's findings
    std::string path{};       ///< of the file that was probably meant
    std::string missing{};
  };

  /// Reports that `folder` on the medium has no entry `part`, a component of the path `relative`.
  void reportMissing(const std::string& relative, const std::string& folder,
                     const std::string& part, const PathUse& use) const;

  void reportUnreadable(const std::string& relative, const PathUse& use, bool isStrings) const;

  const XMLLines& linesOf(const std::string& relative) const;

  std::string root_;
  std::string application_;
  Report& report_;
  mutable std::set<std::string> used_;  ///< every path that exists() has found
  mutable std::vector<Guess> guesses_;
  mutable std::map<std::string, XMLLines>
      lines_;  ///< by the relative path of the property list; filled by linesOf()
};

}  // namespace onramp::check

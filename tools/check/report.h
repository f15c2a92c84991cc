#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

#include "media/connection_type.h"
#include "tools/check/finding.h"

namespace onramp::check {

/// A model as users will get it.
struct ModelRow {
  std::string name{};
  bool usb = false;
  bool wired = false;
  bool wireless = false;
};

/// What the systems of a range are given.
struct PackageRow {
  std::string systems{};  ///< in words
  std::string package{};  ///< relative to the medium; empty for none
};

/// A language of the message bundle.
struct LanguageRow {
  std::string name{};
  std::size_t texts = 0;  ///< of those that the wizard shows
};

/// What is known of a medium once it is checked.
struct Report {
  std::string medium{};
  std::string application{};           ///< its folder's name; empty when there is none
  std::vector<Finding> findings{};     ///< in the order in which the wizard comes across them
  std::vector<ModelRow> models{};      ///< in the order of the wizard's list
  FirstPage start = FirstPage::kNone;  ///< what the wizard begins with
  std::string systems{};               ///< the supported range, in words
  std::vector<PackageRow> packages{};
  std::vector<LanguageRow> languages{};

  [[nodiscard]] std::size_t count(Severity severity) const;
};

}  // namespace onramp::check

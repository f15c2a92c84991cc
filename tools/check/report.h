#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "media/connection_type.h"
#include "tools/check/finding.h"

namespace onramp::check {

/// A model, and the connections that it has according to the medium. The wizard may offer USB for a
/// model without USB, because the connection page always offers USB.
struct ModelRow {
  std::string name{};
  bool usb = false;
  bool wired = false;
  bool wireless = false;
};

/// The package that the wizard opens on a range of systems.
struct PackageRow {
  std::string systems{};  ///< in words
  std::string package{};  ///< relative to the medium; empty when the medium names none
};

/// A language of the message bundle.
struct LanguageRow {
  std::string name{};
  std::size_t texts = 0;  ///< how many of the wizard's texts exist in the language
};

/// The result of a check: the findings, and what users of the medium will see.
struct Report {
  std::string medium{};
  std::string application{};             ///< the bundle's name; empty when there is none
  std::string identifier{};              ///< of the application's bundle
  std::vector<std::string> platforms{};  ///< the systems it has a program for: "macOS", "Linux"
  std::vector<Finding> findings{};       ///< in the order in which the checks made them
  std::vector<ModelRow> models{};        ///< in the order of the wizard's list
  FirstPage start = FirstPage::kNone;    ///< the page that the wizard begins with
  std::string systems{};                 ///< the supported range, in words
  std::vector<PackageRow> packages{};
  std::vector<LanguageRow> languages{};

  /// Returns the number of findings with this severity.
  [[nodiscard]] std::size_t count(Severity severity) const;

  /// Returns whether a finding suggests that a misspelt key in `file` should be `key`.
  [[nodiscard]] bool hasMisspelt(std::string_view file, std::string_view key) const;
};

}  // namespace onramp::check

#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace onramp::check {

enum class Severity {
  kError,    ///< users will probably see something wrong
  kWarning,  ///< what was found may be intended, but often is not
};

/// Where a mistake was found.
struct Place {
  std::string file{};  ///< relative to the medium
  std::vector<std::string>
      key{};  ///< the keys that lead to the value in a property list or strings table
  std::optional<std::size_t> line{};  ///< counted from 1
  std::optional<std::size_t> byte{};  ///< counted from 0, in a file that is not text
};

/// One mistake on a medium. `found`, `expected`, `effect` and `remedy` are phrases without a full
/// stop. writeText() leaves out empty phrases.
struct Finding {
  std::string id{};  ///< the broken rule's name, such as "key-missing"; programs rely on it
  Severity severity = Severity::kError;
  Place place{};
  std::string found{};
  std::string expected{};
  std::string nearest{};  ///< the known spelling that was probably meant
  std::string effect{};   ///< what users will see because of the mistake
  std::string remedy{};
};

/// Returns `text` in quotation marks.
[[nodiscard]] inline std::string quoted(std::string text) {
  return '"' + std::move(text) + '"';
}

/// Returns `words` with commas between them.
[[nodiscard]] inline std::string joined(const std::vector<std::string>& words) {
  std::string text;
  for (const std::string& word : words)
    text += (text.empty() ? "" : ", ") + word;
  return text;
}

}  // namespace onramp::check

#pragma once

#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "base/value.h"
#include "tools/check/report.h"

namespace onramp::check {

enum class Kind { kText, kPath, kBoolean, kNumberOrText, kDictionary, kAny };
enum class Need { kRequired, kAdvised, kOptional };

/// A key that the wizard reads from a dictionary.
struct KeyRule {
  std::string_view key;
  Kind kind;
  Need need;
  const char* otherwise;  ///< what users see when it is absent or of another kind
};

/// Where a dictionary stands.
struct DictionaryPlace {
  std::string file;
  std::vector<std::string> path;

  [[nodiscard]] Place of(std::string_view key) const;
};

/// What to do with a key that no rule names.
enum class OtherKeys { kReported, kAllowed };

/// Reports keys of `dictionary` that are unknown, misspelt, missing or of the wrong kind. A key
/// that is nearly one of the absent known keys is reported as that one's misspelling, even where
/// other keys are allowed.
void checkKeys(const Dictionary& dictionary, const DictionaryPlace& place,
               std::span<const KeyRule> rules, OtherKeys otherKeys, Report& report);

/// The value in words: its kind, and for a text or a number itself.
[[nodiscard]] std::string described(const Value& value);

}  // namespace onramp::check

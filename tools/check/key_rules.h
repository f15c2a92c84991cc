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
  const char* otherwise;  ///< what users see when the key is absent or its value is of another kind
  const char* meaning = "";  ///< of the value, where its kind alone does not explain it
};

/// The location of a dictionary: its file and the path of keys that leads to it.
struct DictionaryPlace {
  std::string file;
  std::vector<std::string> path;

  [[nodiscard]] Place of(std::string_view key) const;
};

/// What to do with a key that no rule names.
enum class OtherKeys { kReported, kAllowed };

/// Reports keys of `dictionary` that are unknown, misspelt or missing, and values of the wrong
/// kind. An unknown key that is spelled almost like an absent known key is reported as a
/// misspelling of it, even where other keys are allowed.
void checkKeys(const Dictionary& dictionary, const DictionaryPlace& place,
               std::span<const KeyRule> rules, OtherKeys otherKeys, Report& report);

/// Returns the value's kind in words, followed by the value itself if it is a boolean, a number or
/// a text.
[[nodiscard]] std::string described(const Value& value);

}  // namespace onramp::check

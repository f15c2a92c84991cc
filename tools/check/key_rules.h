#pragma once

#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "base/value.h"
#include "tools/check/report.h"

namespace onramp::check {

/// The kind of value that a key must have.
enum class Kind { kText, kPath, kBoolean, kNumberOrText, kDictionary, kAny };

/// How a missing key is reported: as an error, as a warning, or not at all.
enum class Need { kRequired, kAdvised, kOptional };

/// A key that the wizard reads from a dictionary.
struct KeyRule {
  std::string_view key;
  Kind kind;
  Need need;
  const char* otherwise;     ///< the effect if the key is absent or its value is of the wrong kind
  const char* meaning = "";  ///< describes the expected value more precisely than its kind
};

/// The location of a dictionary: its file, and the keys that lead to it from the outermost
/// dictionary.
struct DictionaryPlace {
  std::string file;
  std::vector<std::string> path;

  /// Returns the place of `key` in the dictionary.
  [[nodiscard]] Place of(std::string_view key) const;
};

/// Says whether a key that no rule names is reported.
enum class OtherKeys { kReported, kAllowed };

/// Reports keys of `dictionary` that are unknown, misspelt or missing, and values of the wrong
/// kind. A key is misspelt if it is unknown and spelled almost like a known key that is absent.
/// Misspelt keys are reported even where other keys are allowed.
void checkKeys(const Dictionary& dictionary, const DictionaryPlace& place,
               std::span<const KeyRule> rules, OtherKeys otherKeys, Report& report);

/// Returns the value's kind in words. For a boolean, a number or a string, the value itself
/// follows.
[[nodiscard]] std::string described(const Value& value);

}  // namespace onramp::check

#include "tools/check/key_rules.h"

#include <algorithm>
#include <set>
#include <variant>

#include "base/ascii.h"
#include "tools/check/spelling.h"

namespace onramp::check {

namespace {

struct Describe {
  std::string operator()(bool flag) const {
    return flag ? "the boolean true" : "the boolean false";
  }
  std::string operator()(std::int64_t number) const {
    return "the number " + std::to_string(number);
  }
  std::string operator()(std::uint64_t number) const {
    return "the number " + std::to_string(number);
  }
  std::string operator()(double number) const { return "the number " + std::to_string(number); }
  std::string operator()(const std::string& text) const { return "the string " + quoted(text); }
  std::string operator()(const Data&) const { return "data"; }
  std::string operator()(Date) const { return "a date"; }
  std::string operator()(const Array&) const { return "an array"; }
  std::string operator()(const Dictionary&) const { return "a dictionary"; }
};

bool isOfKind(const Value& value, Kind kind) {
  switch (kind) {
    case Kind::kText:
    case Kind::kPath:
      return value.as<std::string>() != nullptr;
    case Kind::kBoolean:
      return value.boolean().has_value();
    case Kind::kNumberOrText:
      return value.as<std::string>() || (value.boolean() && !value.as<bool>());
    case Kind::kDictionary:
      return value.as<Dictionary>() != nullptr;
    case Kind::kAny:
      return true;
  }
  return true;
}

const char* expectationOf(Kind kind) {
  switch (kind) {
    case Kind::kText:
      return "a string";
    case Kind::kPath:
      return "a string: a path from the medium's top folder";
    case Kind::kBoolean:
      return "a boolean, <true/> or <false/>";
    case Kind::kNumberOrText:
      return "a string or a number";
    case Kind::kDictionary:
      return "a dictionary";
    case Kind::kAny:
      break;
  }
  return "any value";
}

// Returns the remedy for a value that should be of the kind `kind`.
std::string remedyFor(Kind kind, const Value& value) {
  if (kind != Kind::kBoolean) return std::string("write ") + expectationOf(kind);
  const auto* const text = value.as<std::string>();
  const std::string word = text ? asciiLowercased(*text) : "";
  if (word == "yes" || word == "true" || word == "1") return "write <true/>";
  if (word == "no" || word == "false" || word == "0") return "write <false/>";
  return "write <true/> or <false/>";
}

class KeyCheck {
 public:
  KeyCheck(const Dictionary& dictionary, const DictionaryPlace& place,
           std::span<const KeyRule> rules, Report& report)
      : dictionary_(dictionary), place_(place), rules_(rules), report_(report) {
    for (const KeyRule& rule : rules_) {
      known_.insert(rule.key);
      if (!dictionary_.find(rule.key)) absent_.emplace_back(rule.key);
    }
  }

  void unknown(OtherKeys otherKeys) {
    Spelling spelling(absent_);
    for (const auto& [key, value] : dictionary_) {
      if (known_.contains(key)) continue;
      const auto meant = spelling.nearest(key);
      if (meant && meantKeys_.insert(*meant).second) {
        misspelt(key, *meant);
      } else if (otherKeys == OtherKeys::kReported) {
        report_.findings.push_back({.id = "key-unknown",
                                    .severity = Severity::kWarning,
                                    .place = place_.of(key),
                                    .found = "a key that the wizard does not read",
                                    .effect = "none, because the wizard ignores the key",
                                    .remedy = "remove the key"});
      }
    }
  }

  void missing() {
    for (const KeyRule& rule : rules_) {
      if (rule.need == Need::kOptional || dictionary_.find(rule.key)) continue;
      if (meantKeys_.contains(std::string(rule.key))) continue;
      report_.findings.push_back(
          {.id = "key-missing",
           .severity = rule.need == Need::kRequired ? Severity::kError : Severity::kWarning,
           .place = {.file = place_.file, .key = place_.path},
           .found = "no " + quoted(std::string(rule.key)),
           .expected = std::string(expectationOf(rule.kind)) + rule.meaning,
           .effect = rule.otherwise,
           .remedy = "add " + quoted(std::string(rule.key))});
    }
  }

  void wrongKinds() {
    for (const KeyRule& rule : rules_) {
      const Value* const value = dictionary_.find(rule.key);
      if (!value || isOfKind(*value, rule.kind)) continue;
      report_.findings.push_back({.id = "value-kind",
                                  .place = place_.of(rule.key),
                                  .found = described(*value),
                                  .expected = expectationOf(rule.kind),
                                  .effect = rule.otherwise,
                                  .remedy = remedyFor(rule.kind, *value)});
    }
  }

 private:
  void misspelt(const std::string& key, const std::string& meant) {
    const auto rule = std::find_if(rules_.begin(), rules_.end(), [&](const KeyRule& candidate) {
      return candidate.key == meant;
    });
    report_.findings.push_back({.id = "key-misspelt",
                                .place = place_.of(key),
                                .found = "an unknown key",
                                .nearest = meant,
                                .effect = rule->otherwise,
                                .remedy = "rename the key to " + quoted(meant)});
  }

  const Dictionary& dictionary_;
  const DictionaryPlace& place_;
  std::span<const KeyRule> rules_;
  Report& report_;
  std::set<std::string_view> known_;
  std::vector<std::string> absent_;
  std::set<std::string> meantKeys_;
};

}  // namespace

Place DictionaryPlace::of(std::string_view key) const {
  Place place{.file = file, .key = path};
  place.key.emplace_back(key);
  return place;
}

std::string described(const Value& value) {
  return std::visit(Describe(), value.storage());
}

void checkKeys(const Dictionary& dictionary, const DictionaryPlace& place,
               std::span<const KeyRule> rules, OtherKeys otherKeys, Report& report) {
  KeyCheck check(dictionary, place, rules, report);
  check.unknown(otherKeys);
  check.missing();
  check.wrongKinds();
}

}  // namespace onramp::check

#include <algorithm>

#include "base/ascii.h"
#include "media/medium.h"
#include "tools/check/checks.h"
#include "tools/check/supported_range.h"

namespace onramp::check {

namespace {

// Returns advice on how to write a maximum that includes all of the major version `major`.
std::string supportAllOf(std::int64_t major) {
  return "to support all of " + std::to_string(major) + ", write " + std::to_string(major + 1) +
         ", 0, 0";
}

class RangeCheck {
 public:
  RangeCheck(const Lists& lists, Report& report) : lists_(lists), report_(report), range_(lists) {}

  void run() {
    report_.systems = range_.words();
    checkNumbers(medium::kSystemMin, range_.minimum());
    checkNumbers(medium::kSystemMax, range_.maximum());
    checkEmptyRange();
    checkNamedMaximum();
    checkFirstMinorVersion();
    checkApplicationsOwnMinimum();
  }

 private:
  void checkNumbers(std::string_view which, const Dictionary& bound) {
    constexpr std::int64_t kNewestMajor = 1000;
    const std::int64_t major = bound.integerValue("Major");
    const bool isMajor = major > 0 && major < kNewestMajor;
    for (const char* const key : {"Major", "Minor", "BugFix"}) {
      const auto text = bound.string(key);
      if (!text) continue;
      const bool every = which == medium::kSystemMax && key == std::string_view("BugFix") &&
                         asciiLowercased(*text) == "x";
      if (isVersionNumber(*text) || every) continue;
      report_.findings.push_back(
          {.id = "version-number",
           .place = lists_.resourcePlace(which, key),
           .found = "the string " + quoted(*text),
           .expected = which == medium::kSystemMax && key == std::string_view("BugFix")
                           ? "a whole number, or \"x\" for all of that minor version"
                           : "a whole number",
           .effect = "the value counts as " + std::to_string(leadingInteger(*text)),
           .remedy = which == medium::kSystemMax && key == std::string_view("Minor") && isMajor
                         ? supportAllOf(major) + "; otherwise, write a whole number"
                         : "write a whole number"});
    }
  }

  void checkEmptyRange() {
    if (!isBound(range_.maximum())) return;
    if (range_.contains(range_.begin())) return;
    report_.findings.push_back({.id = "range-empty",
                                .place = lists_.resourcePlace(medium::kSystemMax),
                                .found = "a range that contains no system: " + report_.systems,
                                .expected = "a maximum later than the minimum",
                                .effect = "every system is refused",
                                .remedy = "correct \"SystemMin\" or \"SystemMax\""});
  }

  // Warns when the maximum's "BugFix" is a number, because the wizard refuses the very release that
  // such a maximum names. Does not warn when that release is the first of a major version, because
  // this is the usual way to exclude the whole major version.
  void checkNamedMaximum() {
    const Dictionary& maximum = range_.maximum();
    const auto text = maximum.string("BugFix");
    const bool written = text ? isVersionNumber(*text) : maximum.find("BugFix") != nullptr;
    if (!isBound(maximum) || !written || range_.takesAllBugFixes()) return;
    const Version named = boundOf(maximum);
    if ((named[1] == 0 && named[2] == 0) || !range_.contains(range_.begin())) return;
    const std::string name = dotted(named);
    report_.findings.push_back(
        {.id = "range-excludes-maximum",
         .severity = Severity::kWarning,
         .place = lists_.resourcePlace(medium::kSystemMax, "BugFix"),
         .found = "the supported systems: " + report_.systems,
         .expected = "\"x\" for \"BugFix\" to accept all of " + std::to_string(named[0]) + "." +
                     std::to_string(named[1]) + ", or the first release that is refused",
         .effect = name + " itself is refused as too new",
         .remedy = "keep this only if " + name + " is meant to be refused"});
  }

  // Warns when the range ends with minor version 0 of macOS 11 or later, such as 14.0, but begins
  // in an earlier major version. Ignores maximums before macOS 11, because until then each yearly
  // release was a minor version.
  void checkFirstMinorVersion() {
    constexpr std::int64_t kFirstYearlyMajor = 11;
    const Dictionary& maximum = range_.maximum();
    const Version last = boundOf(maximum);
    const Value* const minor = maximum.find("Minor");
    const auto text = maximum.string("Minor");
    const bool isNumber = text ? isVersionNumber(*text) : minor && !minor->as<bool>();
    if (!isBound(maximum) || !range_.takesAllBugFixes() || !isNumber ||
        !range_.contains(range_.begin()) || last[0] < kFirstYearlyMajor || last[1] != 0 ||
        range_.begin()[0] == last[0]) {
      return;
    }
    const std::string major = std::to_string(last[0]);
    report_.findings.push_back({.id = "range-stops-at-minor",
                                .severity = Severity::kWarning,
                                .place = lists_.resourcePlace(medium::kSystemMax, "Minor"),
                                .found = "the supported systems: " + report_.systems,
                                .expected = "a range to the last release of macOS " + major,
                                .effect = major + ".1 is refused as too new",
                                .remedy = supportAllOf(last[0]) + "; otherwise, keep it"});
  }

  void checkApplicationsOwnMinimum() {
    constexpr const char* kKey = "LSMinimumSystemVersion";
    const auto oldest = applicationsMinimum(lists_);
    if (!oldest || !range_.contains(range_.begin())) return;
    const Dictionary& maximum = range_.maximum();
    if (!isBound(maximum) || !isNewerThan(maximum, *oldest)) return;
    report_.findings.push_back(
        {.id = "range-before-application",
         .place = {.file = lists_.informationPath, .key = {kKey}},
         .found =
             "an application for " + lists_.information->string(kKey).value_or("") + " and later",
         .expected = "an application that starts on the supported systems: " + report_.systems,
         .effect = "the wizard starts on none of the systems that the medium supports",
         .remedy = "widen the range with \"SystemMax\""});
  }

  const Lists& lists_;
  Report& report_;
  SupportedRange range_;
};

}  // namespace

void checkRange(const Lists& lists, Report& report) {
  if (lists.resources) RangeCheck(lists, report).run();
}

}  // namespace onramp::check

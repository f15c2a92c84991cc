#include "tools/check/supported_range.h"

#include <algorithm>
#include <vector>

#include "base/ascii.h"

namespace onramp::check {

namespace {

SystemVersion systemOf(const Version& version) {
  return {version[0], version[1], version[2]};
}

}  // namespace

Version boundOf(const Dictionary& bound) {
  return {bound.integerValue("Major"), bound.integerValue("Minor"), bound.integerValue("BugFix")};
}

std::string dotted(const Version& version) {
  const std::string text = std::to_string(version[0]) + "." + std::to_string(version[1]);
  return version[2] == 0 && version[1] == 0 ? text : text + "." + std::to_string(version[2]);
}

bool isVersionNumber(const std::string& text) {
  return !text.empty() && std::all_of(text.begin(), text.end(), isASCIIDigit);
}

std::optional<SystemVersion> applicationsMinimum(const Lists& lists) {
  const auto own =
      lists.information ? lists.information->string("LSMinimumSystemVersion") : std::nullopt;
  if (!own) return std::nullopt;
  const std::size_t point = std::min(own->find('.'), own->size());
  return systemVersion({own->substr(0, point), own->substr(std::min(point + 1, own->size()))});
}

SupportedRange::SupportedRange(const Lists& lists) {
  info_.setCDCommonInfoValue(lists.resources);
}

bool SupportedRange::contains(const Version& version) const {
  return systemSupport(systemOf(version), minimum(), maximum()) == SystemSupport::kSupported;
}

Version SupportedRange::begin() const {
  return isBound(minimum()) ? boundOf(minimum()) : Version{};
}

std::optional<Version> SupportedRange::end() const {
  if (!isBound(maximum())) return std::nullopt;
  Version end = boundOf(maximum());
  if (takesAllBugFixes()) end = {end[0], end[1] + 1, 0};
  return end;
}

bool SupportedRange::takesAllBugFixes() const {
  Version beyond = boundOf(maximum());
  beyond[2] = INT64_MAX;
  return !isNewerThan(maximum(), systemOf(beyond));
}

std::string SupportedRange::words(const Version& from, const std::optional<Version>& to) const {
  const std::string first = from == Version{} ? "" : dotted(from);
  if (!to) return first.empty() ? "every system" : first + " and later";
  const bool isEnd = to == end() && takesAllBugFixes();
  const Version last = boundOf(maximum());
  const std::string until =
      isEnd ? "up to the last " + std::to_string(last[0]) + "." + std::to_string(last[1]) + ".x"
            : "up to, but not including, " + dotted(*to);
  return first.empty() ? until : first + " " + until;
}

}  // namespace onramp::check

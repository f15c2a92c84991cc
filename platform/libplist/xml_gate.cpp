#include "platform/libplist/xml_gate.h"

#include <algorithm>
#include <cstdint>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/property_list.h"

namespace onramp::libplist {

namespace {

constexpr std::size_t kNone = std::string::npos;

// Limits the part of libplist's work that grows quadratically with the size of the list. One cause
// is a dictionary with many keys, because libplist hashes the keys into a fixed number of chains.
// The other is a text with many entities, because libplist moves the rest of the text at each one.
constexpr std::uint64_t kMostSquaredSteps = std::uint64_t{1} << 29;

class XMLWalk {
 public:
  XMLWalk(std::string& text, ParseProblem& problem) : text_(text), problem_(problem) {}

  bool run() {
    if (const std::size_t null = text_.find('\0'); null != kNone) {
      return refuse("a null character, which XML does not allow", null);
    }
    while (at_ < text_.size()) {
      const std::size_t markup = std::min(text_.find('<', at_), text_.size());
      if (!characters(markup)) return false;
      at_ = markup;
      if (at_ < text_.size() && !markupHere()) return false;
    }
    return containers_.empty() || refuse("a container that is never closed", innermost().name);
  }

 private:
  struct Container {
    std::size_t name;
    std::size_t nameSize;
    std::uint64_t keys;
  };

  bool refuse(std::string reason, std::size_t where) {
    problem_.note(std::move(reason), where);
    return false;
  }

  [[nodiscard]] const Container& innermost() const { return containers_.back(); }

  bool characters(std::size_t end) {
    const std::string_view run = std::string_view(text_).substr(at_, end - at_);
    const auto entities = static_cast<std::uint64_t>(std::count(run.begin(), run.end(), '&'));
    return spend(entities * run.size()) ||
           refuse("more references (&…;) than the limit allows", at_);
  }

  bool markupHere() {
    const std::string_view here = std::string_view(text_).substr(at_);
    if (here.starts_with("<?")) return skipPast("?>", 1) && quotesArePaired();
    if (!here.starts_with("<!")) return skipPast(">", 1) && quotesArePaired("<") && tag();
    if (here.starts_with("<!--")) return skipPast("-->", 4);
    if (here.starts_with("<![CDATA[")) return skipPast("]]>", 9);
    if (!here.starts_with("<!DOCTYPE")) return refuse("markup of an unknown kind", at_);
    return skipPast(">", 9) && quotesArePaired("[");
  }

  // Moves past the first `end` that begins at least `from` characters from here. Sets `skipped_` to
  // the markup before that `end`, without the first `from` characters. Refuses the list when no
  // `end` follows.
  bool skipPast(std::string_view end, std::size_t from) {
    const std::size_t found = text_.find(end, at_ + from);
    if (found == kNone) {
      return refuse("markup that begins here and lacks its \"" + std::string(end) + "\"", at_);
    }
    skipped_ = std::string_view(text_).substr(at_ + from, found - at_ - from);
    start_ = at_ + from;
    at_ = found + end.size();
    return true;
  }

  // Refuses the list and returns false when the markup that skipPast() has skipped contains one of
  // the characters in `refused` or an odd number of quotation marks. If the number is odd, the
  // `end` that skipPast() has found is inside quotation marks.
  [[nodiscard]] bool quotesArePaired(std::string_view refused = "") {
    if (std::count(skipped_.begin(), skipped_.end(), '"') % 2 != 0) {
      return refuse("markup with a quotation mark that is never closed", start_);
    }
    const std::size_t found = skipped_.find_first_of(refused);
    return found == kNone ||
           refuse(std::string("a \"") + skipped_[found] + "\" inside other markup", start_);
  }

  bool tag() {
    const bool empty = skipped_.ends_with('/');
    std::string_view name = skipped_.substr(0, skipped_.find_first_of(" \t\r\n"));
    if (name.ends_with('/')) name.remove_suffix(1);
    if (name.starts_with('/')) return close(name.substr(1));
    if (++objects_ > kMostPropertyListObjects) {
      return refuse("more than " + std::to_string(kMostPropertyListObjects) + " elements", start_);
    }
    if (name == "key" && !containers_.empty()) ++containers_.back().keys;
    if (name == "integer" && !empty) blankLeadingZeros();
    if (empty || !isContainer(name)) return true;
    containers_.push_back({start_, name.size(), 0});
    return containers_.size() <= kMostPropertyListDepth + 1 ||  // the outermost is <plist>
           refuse("more than " + std::to_string(kMostPropertyListDepth) +
                      " containers nested in each other",
                  start_);
  }

  static bool isContainer(std::string_view name) {
    return name == "dict" || name == "array" || name == "plist";
  }

  bool close(std::string_view name) {
    if (!isContainer(name)) return true;
    if (containers_.empty()) return refuse("the end of a container that was not opened", start_);
    const Container closed = innermost();
    containers_.pop_back();
    if (text_.compare(closed.name, closed.nameSize, name) != 0) {
      return refuse("\"</" + std::string(name) + ">\" where \"</" +
                        text_.substr(closed.name, closed.nameSize) + ">\" is expected",
                    start_);
    }
    return spend(closed.keys * closed.keys) ||
           refuse("more keys than the limit allows", closed.name);
  }

  bool spend(std::uint64_t steps) {
    steps_ += steps;
    return steps_ <= kMostSquaredSteps;
  }

  void blankLeadingZeros() {
    std::size_t digit = text_.find_first_not_of(" \t\r\n", at_);
    if (digit != kNone && (text_[digit] == '-' || text_[digit] == '+')) ++digit;
    const auto isDigit = [this](std::size_t index) {
      return index < text_.size() && text_[index] >= '0' && text_[index] <= '9';
    };
    while (isDigit(digit) && text_[digit] == '0' && isDigit(digit + 1))
      text_[digit++] = ' ';
  }

  std::string& text_;
  ParseProblem& problem_;
  std::size_t at_ = 0;
  std::size_t start_ = 0;
  std::string_view skipped_;
  std::vector<Container> containers_;
  std::uint64_t objects_ = 0;
  std::uint64_t steps_ = 0;
};

}  // namespace

std::optional<std::string> admittedXML(std::string text, ParseProblem& problem) {
  if (text.size() > kMostPropertyListBytes) {
    problem.note("more than " + std::to_string(kMostPropertyListBytes) + " bytes", 0);
    return std::nullopt;
  }
  return XMLWalk(text, problem).run() ? std::optional(std::move(text)) : std::nullopt;
}

}  // namespace onramp::libplist

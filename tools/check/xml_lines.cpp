#include "tools/check/xml_lines.h"

#include <expat.h>

#include <algorithm>
#include <array>
#include <memory>
#include <string_view>
#include <type_traits>

namespace onramp::check {

namespace {

struct ParserFree {
  void operator()(XML_Parser parser) const { XML_ParserFree(parser); }
};
using Parser = std::unique_ptr<std::remove_pointer_t<XML_Parser>, ParserFree>;

class Walk {
 public:
  explicit Walk(XML_Parser parser, XMLLines& lines) : parser_(parser), lines_(lines) {
    XML_SetUserData(parser, this);
    XML_SetElementHandler(parser, begin, end);
    XML_SetCharacterDataHandler(parser, characters);
  }

 private:
  struct Element {
    std::string name;
    bool named = false;      ///< this is the value of the key at the end of `path_`
    bool keyBefore = false;  ///< the latest child is a key
  };

  static void begin(void* self, const XML_Char* name, const XML_Char**) {
    static_cast<Walk*>(self)->begin(name);
  }
  static void end(void* self, const XML_Char*) { static_cast<Walk*>(self)->end(); }
  static void characters(void* self, const XML_Char* text, int size) {
    static_cast<Walk*>(self)->characters({text, static_cast<std::size_t>(size)});
  }

  [[nodiscard]] std::size_t line() const { return XML_GetCurrentLineNumber(parser_); }

  void complain(std::string problem) {
    if (!lines_.problem.empty()) return;
    lines_.problem = std::move(problem);
    lines_.problemLine = line();
  }

  void begin(std::string_view name) {
    constexpr std::array kNames = {"plist", "dict", "array", "key",  "string", "integer",
                                   "real",  "true", "false", "data", "date"};
    if (std::find(kNames.begin(), kNames.end(), name) == kNames.end()) {
      complain("an element <" + std::string(name) + ">, which property lists do not have");
    }
    const bool named = !open_.empty() && open_.back().name == "dict" && inDictionary(name);
    if (name == "key") keyLine_ = line();
    if (name == "array") ++arrays_;
    text_.clear();
    open_.push_back({std::string(name), named});
  }

  // Called at the beginning of each child of a dictionary. Returns whether the child is the value
  // of a key.
  bool inDictionary(std::string_view name) {
    Element& dictionary = open_.back();
    const bool isValue = name != "key" && dictionary.keyBefore;
    if (name == "key" && dictionary.keyBefore) complain("a key that no value follows");
    if (name != "key" && !dictionary.keyBefore) complain("a value without a key before it");
    if (name == "key" && !dictionary.keyBefore) path_.emplace_back();
    dictionary.keyBefore = name == "key";
    return isValue;
  }

  void end() {
    const Element closed = open_.back();
    open_.pop_back();
    if (closed.name == "dict" && closed.keyBefore) {
      complain("a key that no value follows");
      path_.pop_back();
    }
    if (closed.name == "array") --arrays_;
    if (closed.named) path_.pop_back();
    const bool isKey = closed.name == "key" && !open_.empty() && open_.back().name == "dict";
    if (!isKey) return;
    path_.back() = text_;
    // `path_` has no array indexes, so the dictionaries in an array would seem to be one dictionary
    // that repeats its keys.
    if (arrays_ == 0 && !lines_.keys.emplace(path_, keyLine_).second && !isInRepetition()) {
      lines_.twice.emplace_back(path_, keyLine_);
    }
  }

  // Returns whether an enclosing dictionary is the value of the last key that was repeated.
  [[nodiscard]] bool isInRepetition() const {
    if (lines_.twice.empty()) return false;
    const std::vector<std::string>& last = lines_.twice.back().first;
    return last.size() < path_.size() && std::equal(last.begin(), last.end(), path_.begin());
  }

  void characters(std::string_view text) {
    text_ += text;
    const bool blank = text.find_first_not_of(" \t\r\n") == std::string_view::npos;
    if (!blank && !open_.empty() && (open_.back().name == "dict" || open_.back().name == "array")) {
      complain("text where an element is expected");
    }
  }

  XML_Parser parser_;
  XMLLines& lines_;
  std::vector<Element> open_;
  std::vector<std::string> path_;
  std::string text_;
  std::size_t keyLine_ = 0;
  std::size_t arrays_ = 0;  ///< how many arrays are open
};

}  // namespace

bool isXML(const std::string& text) {
  const std::size_t first = text.find_first_not_of(" \t\r\n");
  return first != std::string::npos && text[first] == '<';
}

XMLLines xmlLines(const std::string& xml) {
  XMLLines lines;
  const Parser parser(XML_ParserCreate("UTF-8"));
  if (!parser) return lines;
  const Walk walk(parser.get(), lines);
  if (XML_Parse(parser.get(), xml.data(), static_cast<int>(xml.size()), XML_TRUE) ==
          XML_STATUS_ERROR &&
      lines.problem.empty()) {
    lines.problem = XML_ErrorString(XML_GetErrorCode(parser.get()));
    lines.problemLine = XML_GetCurrentLineNumber(parser.get());
  }
  return lines;
}

}  // namespace onramp::check

#include "platform/libplist/parse.h"

#include <locale.h>
#if __has_include(<xlocale.h>)
#include <xlocale.h>  // macOS declares newlocale() only here
#endif

#include <cstdint>
#include <memory>
#include <type_traits>
#include <utility>

#include "base/text.h"
#include "platform/libplist/binary_gate.h"
#include "platform/libplist/node.h"
#include "platform/libplist/xml_gate.h"

namespace onramp::libplist {

namespace {

// Sets the thread's locale to "C" while this object exists. libplist reads and writes real numbers
// in the thread's locale. In a desktop program this is the user's locale, which may use a decimal
// comma.
class PlainNumbers {
 public:
  PlainNumbers() : plain_(newlocale(LC_ALL_MASK, "C", nullptr)), before_(uselocale(plain_)) {}
  PlainNumbers(const PlainNumbers&) = delete;
  PlainNumbers& operator=(const PlainNumbers&) = delete;
  ~PlainNumbers() {
    uselocale(before_);
    freelocale(plain_);
  }

 private:
  locale_t plain_;
  locale_t before_;
};

struct XMLFree {
  void operator()(char* text) const { plist_to_xml_free(text); }
};

// Writes carriage returns as references, because an XML reader turns a literal carriage return into
// a line feed.
void referToCarriageReturns(std::string& xml) {
  for (std::size_t at = xml.find('\r'); at != std::string::npos; at = xml.find('\r', at))
    xml.replace(at, 1, "&#13;");
}

// Pads years with zeros, because readers expect a year of four digits.
void padYears(std::string& xml) {
  constexpr std::string_view kDate = "<date>";
  for (std::size_t at = xml.find(kDate); at != std::string::npos; at = xml.find(kDate, at)) {
    at += kDate.size();
    const std::size_t digits = xml.find('-', at) - at;
    if (digits < 4) xml.insert(at, 4 - digits, '0');
  }
}

}  // namespace

std::optional<Value> parsePropertyList(std::string bytes) {
  ParseProblem unused;
  return parsePropertyList(std::move(bytes), unused);
}

std::optional<Value> parsePropertyList(std::string bytes, ParseProblem& problem) {
  const PlainNumbers plainNumbers;
  plist_t root = nullptr;
  if (bytes.starts_with("bplist")) {
    if (!mayReadBinary(bytes, problem)) return std::nullopt;
    plist_from_bin(bytes.data(), static_cast<std::uint32_t>(bytes.size()), &root);
  } else {
    std::optional<std::string> text = decodedText(bytes);
    if (!text) problem.note("characters that are neither UTF-8 nor UTF-16", 0);
    const auto xml = text ? admittedXML(std::move(*text), problem) : std::nullopt;
    if (!xml) return std::nullopt;
    plist_from_xml(xml->c_str(), static_cast<std::uint32_t>(xml->size()), &root);
  }
  const Node node(root);
  return node ? std::optional(valueOf(node.get())) : std::nullopt;
}

std::string formatPropertyList(const Dictionary& dictionary) {
  const PlainNumbers plainNumbers;
  const Node node = nodeOf(dictionary);
  char* text = nullptr;
  std::uint32_t size = 0;
  plist_to_xml(node.get(), &text, &size);
  const std::unique_ptr<char, XMLFree> owned(text);
  std::string xml = text ? std::string(text, size) : std::string();
  referToCarriageReturns(xml);
  padYears(xml);
  return xml;
}

}  // namespace onramp::libplist

#include "tools/devices/browse_text.h"

#include <algorithm>
#include <limits>
#include <string_view>

#include "bonjour/KSDevice.h"
#include "platform/terminal.h"
#include "tools/devices/ber_tree.h"
#include "tools/devices/json_output.h"
#include "tools/devices/name_verdict.h"
#include "tools/devices/text.h"
#include "tools/terminal_text.h"

namespace onramp::devices {

namespace {

constexpr std::size_t kMarkColumns = 11;
constexpr std::size_t kAddressColumns = 15;
constexpr std::size_t kNarrowest = 60;
constexpr std::size_t kUnlimited = std::numeric_limits<std::size_t>::max();
constexpr std::string_view kGreen = "\033[32m";
constexpr std::string_view kYellow = "\033[33m";
constexpr std::string_view kPlain = "\033[0m";

std::string coloured(std::string_view colour, const std::string& text, const TextStyle& style) {
  return style.isColoured ? std::string(colour) + text + std::string(kPlain) : text;
}

struct Columns {
  std::size_t name;
  std::size_t model;
};

// The name and the model share the width that the mark and the address leave.
Columns columnsFor(const TextStyle& style) {
  const std::size_t width = style.width == 0 ? 100 : std::max(style.width, kNarrowest);
  const std::size_t rest = width - kMarkColumns - kAddressColumns - 3;
  return {rest - rest / 2, rest / 2};
}

// Returns `text` in `columns` columns. If the output is not a terminal, longer text is not cut.
std::string cell(std::string_view text, std::size_t columns, const TextStyle& style) {
  if (style.width == 0 && columnsOf(text) > columns) return std::string(text);
  return fitted(text, columns);
}

std::string row(const std::string& mark, std::string_view name, std::string_view model,
                std::string_view address, const TextStyle& style) {
  const Columns columns = columnsFor(style);
  std::string line = mark + cell(name, columns.name, style) + ' ' +
                     cell(model, columns.model, style) + ' ' + std::string(address);
  while (line.ends_with(' '))
    line.pop_back();
  return line + '\n';
}

std::string paragraph(const std::string& text, const TextStyle& style) {
  return wrapped(text, style.width == 0 ? kUnlimited : style.width, 2);
}

// Adds a full stop, except after a service type, which already ends with a dot.
std::string sentence(const std::string& text) {
  return text.ends_with('.') ? text : text + '.';
}

std::string explanation(const Verdict& verdict) {
  return sentence(verdict.why) +
         (verdict.remedy.empty() ? "" : " Remedy: " + sentence(verdict.remedy)) + " [" +
         verdict.id + "]";
}

std::string delayText(const Delay& delay) {
  if (delay.delayed == 0) return "";
  return "The wizard's window does not respond for " + durationText(delay.seconds) +
         ", which delays " + std::to_string(delay.delayed) + " of the listed devices" +
         (delay.hidden == 0 ? "" : " and hides " + std::to_string(delay.hidden) + " of them") + '.';
}

std::string indented(std::string_view text, std::size_t indent) {
  std::string out;
  while (!text.empty()) {
    const std::size_t end = std::min(text.find('\n'), text.size() - 1);
    out += std::string(indent, ' ') + std::string(text.substr(0, end + 1));
    text.remove_prefix(end + 1);
  }
  return out;
}

std::string listOf(const std::vector<std::string>& texts) {
  std::string all;
  for (const std::string& text : texts)
    all += (all.empty() ? "" : ", ") + text;
  return all.empty() ? "none" : all;
}

std::string detailsOf(const Device& device) {
  std::string out = "  domain " + device.domain + ", types " + listOf(device.types) + '\n';
  if (!device.sightings.empty()) {
    out += "  seen on " + listOf({device.sightings.begin(), device.sightings.end()}) + '\n';
  }
  out += "  found after " + durationText(device.found);
  out += device.resolved ? ", resolved after " + durationText(*device.resolved) : ", not resolved";
  out += '\n';
  for (const auto& [key, value] : device.record) {
    const auto* const text = value.as<std::string>();
    if (text) out += "  " + key + ": " + inQuotes(*text) + '\n';
  }
  if (device.resolved) {
    out += "  " + std::string(KSDevice::kIPAddressList) + ": " +
           listOf(ipv4AddressesOf(device.record)) + '\n';
    out += "  IPv6 addresses: " + listOf(device.ipv6) + '\n';
  }
  for (const std::string& text : txtStrings(device.txt))
    out += "  TXT " + inQuotes(text) + '\n';
  if (!device.answer) return out;
  for (const Exchange& exchange : device.answer->exchanges)
    out += "  SNMP " + exchangeLine(exchange) + '\n';
  if (const Exchange* const told = device.answer->telling()) out += packetsOf(*told, 4);
  return out;
}

}  // namespace

TextStyle outputStyle(bool isVerbose) {
  const bool isTerminal = isOutputTerminal();
  return {
      .isColoured = isTerminal, .isVerbose = isVerbose, .width = isTerminal ? terminalWidth() : 0};
}

std::string tableHead(const Medium& medium, const TextStyle& style) {
  const bool isForAll = medium.choosesModel && medium.models.size() > 1 &&
                        medium.wanted.size() == medium.models.size();
  return (isForAll ? paragraph("Users of this medium choose a model first, and the wizard then "
                               "lists only devices of that model. Add --model to see the list of "
                               "one user.",
                               style)
                   : "") +
         row(fitted("", kMarkColumns), "NAME", "MODEL", "ADDRESS", style);
}

std::string rowOf(const JudgedDevice& judged, const TextStyle& style) {
  const Device& device = *judged.device;
  const auto addresses = ipv4AddressesOf(device.record);
  const bool isListed = judged.verdict.isListed;
  const std::string mark = coloured(
      isListed ? kGreen : kYellow, fitted(isListed ? "listed" : "not listed", kMarkColumns), style);
  const std::string model = device.record.string(KSDevice::kModelName).value_or("");
  std::string out = row(mark, inQuotes(device.name), model.empty() ? "-" : inQuotes(model),
                        addresses.empty() ? "-" : addresses.front(), style);
  if (!isListed) out += paragraph(explanation(judged.verdict), style);
  for (const Verdict& note : judged.notes)
    out += paragraph("Note: " + explanation(note), style);
  return style.isVerbose ? out + detailsOf(device) : out;
}

std::string goneRow(const Device& device, const TextStyle& style) {
  return row(fitted("gone", kMarkColumns), inQuotes(device.name), "", "", style);
}

std::string summaryOf(const BrowseResult& result, const TextStyle& style) {
  const auto listed =
      std::count_if(result.devices.begin(), result.devices.end(),
                    [](const auto& one) { return one.verdict.isListed && !isMissed(one); });
  const auto missed = std::count_if(result.devices.begin(), result.devices.end(), isMissed);
  std::string out;
  for (const JudgedDevice& one : result.devices) {
    const std::string text = delayText(one.delay);
    if (!text.empty()) out += paragraph(inQuotes(one.device->name) + ": " + text, style);
  }
  for (const JudgedDevice& one : result.devices) {
    if (isMissed(one)) {
      out += paragraph(inQuotes(one.device->name) + ": " + explanation(one.notes.back()), style);
    }
  }
  for (const Verdict& problem : result.network)
    out += paragraph(coloured(kYellow, "Network: ", style) + explanation(problem), style);
  out += (result.isInterrupted ? "Interrupted after " : "After ") + durationText(result.seconds) +
         ": " + std::to_string(result.devices.size()) +
         (result.devices.size() == 1 ? " device, " : " devices, ") + std::to_string(listed) +
         " in the wizard's list" +
         (missed == 0 ? "" : ", " + std::to_string(missed) + " missed by its first search") + '\n';
  return out;
}

std::string exchangeLine(const Exchange& exchange) {
  std::string line = exchange.address + ": ";
  switch (exchange.outcome) {
    case Exchange::Outcome::kValue:
      line += std::to_string(exchange.value.value_or(0));
      break;
    case Exchange::Outcome::kError:
      line += errorStatusName(exchange.errorStatus);
      break;
    case Exchange::Outcome::kNone:
      line += "no reply";
      break;
    default:
      line += outcomeName(exchange.outcome);
  }
  return exchange.seconds ? line + " after " + durationText(*exchange.seconds) : line;
}

std::string packetsOf(const Exchange& exchange, std::size_t indent) {
  std::string out;
  for (const auto& [name, bytes] :
       {std::pair("request", &exchange.request), std::pair("reply", &exchange.reply)}) {
    if (bytes->empty()) continue;
    out += std::string(name) + ", " + std::to_string(bytes->size()) + " bytes\n" +
           indented(berTree(*bytes), 2) + indented(hexDump(*bytes), 2);
  }
  return indented(out, indent);
}

}  // namespace onramp::devices

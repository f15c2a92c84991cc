#include <nlohmann/json.hpp>

#include "base/byte_reader.h"
#include "bonjour/KSDevice.h"
#include "tools/devices/ber_tree.h"
#include "tools/devices/browse_result.h"
#include "tools/devices/json_output.h"

namespace onramp::devices {

namespace {

using Json = nlohmann::ordered_json;

constexpr int kFormVersion = 1;

Json jsonOfTexts(const Array* texts) {
  Json list = Json::array();
  for (const Value& text : texts ? *texts : Array()) {
    if (const auto* string = text.as<std::string>()) list.push_back(*string);
  }
  return list;
}

Json jsonOfRecord(const Dictionary& record) {
  Json object = Json::object();
  for (const auto& [key, value] : record) {
    if (const auto* text = value.as<std::string>()) object[key] = *text;
    if (const auto* texts = value.as<Array>()) object[key] = jsonOfTexts(texts);
  }
  return object;
}

Json jsonOfVerdict(const Verdict& verdict) {
  return {{"id", verdict.id}, {"why", verdict.why}, {"remedy", verdict.remedy}};
}

Json jsonOfVerdicts(const std::vector<Verdict>& verdicts) {
  Json list = Json::array();
  for (const Verdict& verdict : verdicts)
    list.push_back(jsonOfVerdict(verdict));
  return list;
}

Json jsonOfDevice(const JudgedDevice& judged) {
  const Device& device = *judged.device;
  Json object{{"name", device.name},
              {"domain", device.domain},
              {"type", device.type},
              {"types", device.types},
              {"listed", judged.verdict.isListed},
              {"verdict", jsonOfVerdict(judged.verdict)},
              {"notes", jsonOfVerdicts(judged.notes)},
              {"found", device.found},
              {"resolved", device.resolved ? Json(*device.resolved) : Json()},
              {"gone", device.gone ? Json(*device.gone) : Json()},
              {"record", jsonOfRecord(device.record)},
              {"txt", txtStrings(device.txt)},
              {"ipv6", device.ipv6},
              {"sightings", device.sightings}};
  if (device.answer) {
    object["answer"] = jsonOfAnswer(*device.answer);
    object["delay"] = {{"seconds", judged.delay.seconds},
                       {"delayed", judged.delay.delayed},
                       {"hidden", judged.delay.hidden}};
  }
  return object;
}

}  // namespace

std::vector<std::string> txtStrings(const std::optional<Data>& txt) {
  std::vector<std::string> strings;
  if (!txt) return strings;
  ByteReader reader{std::span<const std::byte>(*txt)};
  while (const auto length = reader.byte()) {
    const auto text = reader.text(*length);
    if (!text) break;
    strings.emplace_back(*text);
  }
  return strings;
}

Json jsonOfAnswer(const Answer& answer) {
  Json exchanges = Json::array();
  for (const Exchange& one : answer.exchanges) {
    exchanges.push_back({{"address", one.address},
                         {"outcome", outcomeName(one.outcome)},
                         {"seconds", one.seconds ? Json(*one.seconds) : Json()},
                         {"errorStatus", one.errorStatus},
                         {"value", one.value ? Json(*one.value) : Json()},
                         {"changedQuestion", one.changedQuestion},
                         {"request", hexText(one.request)},
                         {"reply", hexText(one.reply)}});
  }
  return {{"wireless", answer.isWireless},
          {"complete", answer.isComplete},
          {"seconds", answer.seconds},
          {"exchanges", exchanges}};
}

std::string outcomeName(Exchange::Outcome outcome) {
  switch (outcome) {
    case Exchange::Outcome::kValue:
      return "value";
    case Exchange::Outcome::kError:
      return "error";
    case Exchange::Outcome::kOtherType:
      return "other-type";
    case Exchange::Outcome::kUnreadable:
      return "unreadable";
    case Exchange::Outcome::kOtherRequest:
      return "other-request";
    case Exchange::Outcome::kRefused:
      return "refused";
    case Exchange::Outcome::kLate:
      return "late";
    case Exchange::Outcome::kNone:
      return "none";
    case Exchange::Outcome::kUnsent:
      return "unsent";
  }
  return "";
}

std::string printed(const Json& json) {
  return json.dump(2, ' ', false, Json::error_handler_t::replace) + '\n';
}

std::string jsonOf(const BrowseResult& result) {
  Json devices = Json::array();
  for (const JudgedDevice& device : result.devices)
    devices.push_back(jsonOfDevice(device));
  return printed({{"version", kFormVersion},
                  {"medium",
                   {{"path", result.medium->path},
                    {"type", result.medium->type},
                    {"models", result.medium->models},
                    {"searchedFor", result.medium->wanted}}},
                  {"seconds", result.seconds},
                  {"interrupted", result.isInterrupted},
                  {"devices", devices},
                  {"network", jsonOfVerdicts(result.network)}});
}

}  // namespace onramp::devices

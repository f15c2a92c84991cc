#include "tools/devices/verdict.h"

#include <algorithm>

#include "bonjour/KSDevice.h"
#include "bonjour/model_match.h"
#include "snmp/protocol.h"
#include "snmp/records.h"
#include "snmp/transport.h"
#include "tools/devices/name_verdict.h"
#include "tools/devices/text.h"

namespace onramp::devices {

namespace {

using Outcome = Exchange::Outcome;

std::string joined(const std::vector<std::string>& texts) {
  std::string all;
  for (const std::string& text : texts)
    all += (all.empty() ? "" : ", ") + text;
  return all;
}

// Returns the verdict on a device that answered `value` and that the wizard does not list.
Verdict judgeValue(std::int64_t value) {
  if (value == kActiveIFWireless) {
    return {.id = "no-answer",
            .why = "reports wireless, but then leaves the wizard's last question without an answer",
            .remedy =
                "search again; if that does not help, look for lost packets between the device "
                "and this computer"};
  }
  const bool isCable = value == 1;
  return {.id = isCable ? "on-cable" : "other-interface",
          .why = (isCable ? "on cable: reports interface " : "reports interface ") +
                 std::to_string(value) + "; wireless would be " + std::to_string(kActiveIFWireless),
          .remedy =
              "connect the device to the wireless network; the wizard lists only devices on "
              "wireless"};
}

Verdict judgeSilence(const Device& device, const Answer& answer,
                     const std::function<bool(const std::string&)>& isLocal) {
  const auto addresses = ipv4AddressesOf(device.record);
  const std::string cost = "no SNMP answer from " + joined(addresses) +
                           ", which costs the wizard " + durationText(answer.seconds);
  if (std::none_of(addresses.begin(), addresses.end(), isLocal)) {
    return {.id = "other-subnet",
            .why = "none of its addresses is in a subnet of this computer; " + cost,
            .remedy =
                "put the device and this computer into the same subnet; "
                "\"onramp-devices hosts\" shows this computer's addresses"};
  }
  return {
      .id = "no-answer",
      .why = cost,
      .remedy = "switch on SNMP v1 for reading in the device, set its community to " +
                inQuotes(kCommunity) +
                " unless the medium's wizard was built for another, and let UDP port 161 through "
                "firewalls"};
}

Verdict judgeAnswer(const Device& device, const Answer& answer,
                    const std::function<bool(const std::string&)>& isLocal) {
  const Exchange* const told = answer.telling();
  switch (told ? told->outcome : Outcome::kNone) {
    case Outcome::kValue:
      return judgeValue(told->value.value_or(0));
    case Outcome::kError:
      return {.id = "no-such-object",
              .why = "answers " + errorStatusName(told->errorStatus) +
                     " when asked which interface it uses",
              .remedy = "update the firmware; this version does not support the request"};
    case Outcome::kOtherType:
      return {.id = "wrong-type",
              .why = "answers with " +
                     std::string(told->type == kTagOctetString ? "a string"
                                                               : "a value of another type") +
                     " where a number is expected",
              .remedy = "update the firmware; this version returns a value of the wrong type"};
    case Outcome::kUnreadable:
    case Outcome::kOtherRequest:
      return {.id = "unreadable-reply",
              .why = told->outcome == Outcome::kUnreadable
                         ? "answers with bytes that are not a proper reply"
                         : "answers with another request's identifier",
              .remedy = "\"onramp-devices ask\" shows the bytes; the firmware must be corrected"};
    case Outcome::kLate:
      return {
          .id = "late",
          .why = "answers late, after " + durationText(told->seconds.value_or(0)) +
                 "; the wizard waits " + std::to_string(kReceiveWait.count()) +
                 " s for each reply, " + durationText(answer.seconds) + " in all",
          .remedy =
              "wake the device up, for instance by pressing a key on its panel, and search again"};
    case Outcome::kRefused:
      return {.id = "refused",
              .why = "refuses SNMP: no program on the device uses UDP port 161",
              .remedy = "switch on SNMP v1 in the device"};
    case Outcome::kNone:
    case Outcome::kUnsent:
      break;
  }
  return judgeSilence(device, answer, isLocal);
}

}  // namespace

bool isAsked(const Device& device, const Medium& medium) {
  return device.resolved && device.type == medium.type && isOneOf(medium.wanted, device.record) &&
         !ipv4AddressesOf(device.record).empty();
}

Verdict judge(const Device& device, const Medium& medium,
              const std::function<bool(const std::string&)>& isLocal) {
  if (!device.resolved) {
    return {
        .id = "unresolved",
        .why = "announced as " + joined(device.types) +
               ", but not resolved: during the search, nothing announced the address of its host",
        .remedy = "switch the device off and on; check that no other device uses its host name"};
  }
  if (auto verdict = judgeName(device, medium)) return *verdict;
  if (device.type != medium.type) {
    return {.id = "other-type",
            .why = "announced as " + joined(device.types) + "; the medium looks for " + medium.type,
            .remedy = "switch on the device's " + medium.type +
                      " service, or write the type that the device announces into the medium's "
                      "BonjourNetwork"};
  }
  if (!isOneOf(medium.wanted, device.record)) {
    return {.id = "other-model",
            .why = "is a " + inQuotes(modelTextOf(device.record)) + ", but the search is for " +
                   (medium.wanted.size() == 1 ? inQuotes(medium.wanted.front()) : "other models"),
            .remedy = "choose the device's own model in the wizard"};
  }
  if (ipv4AddressesOf(device.record).empty()) {
    return {.id = device.ipv6.empty() ? "no-address" : "ipv6-only",
            .why = device.ipv6.empty() ? "has no address"
                                       : "has IPv6 addresses only: " + joined(device.ipv6),
            .remedy = "switch on IPv4 in the device; the wizard uses only IPv4 addresses"};
  }
  if (!device.answer || !device.answer->isComplete) {
    return {.id = "not-asked-yet", .why = "the search ended before the device answered"};
  }
  if (device.answer->isWireless) {
    return {.id = "listed", .isListed = true, .why = "answers that it is on wireless"};
  }
  return judgeAnswer(device, *device.answer, isLocal);
}

std::vector<Verdict> notesOn(const Device& device, const Medium& medium) {
  std::vector<Verdict> notes;
  if (isOneOf(medium.withoutSearch, device.record)) {
    notes.push_back({.id = "model-without-search",
                     .why = "on the medium, its model has no wireless, so no user who chooses the "
                            "model reaches a search",
                     .remedy = "set WirelessLAN to true in ModelInfo.plist if the model has "
                               "wireless"});
  }
  if (!device.answer) return notes;
  const auto& exchanges = device.answer->exchanges;
  if (std::any_of(exchanges.begin(), exchanges.end(),
                  [](const Exchange& e) { return e.changedQuestion; })) {
    notes.push_back(
        {.id = "changed-question",
         .why = "its reply names a different object, and the wizard asks all later devices "
                "for that object",
         .remedy = "switch the device off while others are set up; the fault is in its "
                   "firmware, which must repeat the object's name (OID) from the request"});
  }
  return notes;
}

}  // namespace onramp::devices

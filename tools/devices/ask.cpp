#include <iostream>

#include "platform/host_lookup.h"
#include "platform/interruption.h"
#include "platform/main_loop.h"
#include "platform/run_loop.h"
#include "snmp/protocol.h"
#include "tools/devices/browse_text.h"
#include "tools/devices/commands.h"
#include "tools/devices/json_output.h"
#include "tools/devices/progress.h"
#include "tools/devices/questions.h"
#include "tools/devices/text.h"

namespace onramp::devices {

namespace {

constexpr int kWireless = 0;
constexpr int kNotWireless = 1;

int exitStatusOf(const Answer& answer) {
  if (answer.isWireless) return kWireless;
  const Exchange* const told = answer.telling();
  return told && told->value ? kNotWireless : kTrouble;
}

std::string questionText(const std::string& address) {
  std::string object;
  for (const std::uint16_t arc : kActiveIFObject)
    object += (object.empty() ? "" : ".") + std::to_string(arc);
  return address + ", UDP port " + std::to_string(kSnmpPort) + ", community " +
         inQuotes(kCommunity) + "\nobject " + object + '\n';
}

std::string conclusionOf(const Answer& answer) {
  const Exchange* const told = answer.telling();
  if (!answer.isComplete) return "interrupted before the device answered\n";
  if (told && told->outcome == Exchange::Outcome::kUnsent) {
    return "this computer could not send the question; check the address, and this computer's "
           "network connection and firewall\n";
  }
  if (answer.isWireless) return "wireless\n";
  if (!told || !told->value) return "no usable answer: not in the wizard's list\n";
  if (*told->value == kActiveIFWireless) {
    return "reports wireless, but left the last question without an answer: not in the wizard's "
           "list\n";
  }
  return "not wireless (wireless would be " + std::to_string(kActiveIFWireless) +
         "): not in the wizard's list\n";
}

std::string textOf(const std::string& address, const Answer& answer, bool isVerbose) {
  std::string out = questionText(address);
  const Exchange* const told = answer.telling();
  for (const Exchange& exchange : answer.exchanges) {
    out += exchangeLine(exchange) + '\n';
    if (isVerbose || &exchange == told) out += packetsOf(exchange, 2);
  }
  return out + conclusionOf(answer);
}

Answer askedAt(const std::string& address, Progress& progress) {
  Questions questions;
  Answer answer;
  onInterruption([] { endMainLoop(); });
  questions.ask({address}, [&answer](Answer given) {
    answer = std::move(given);
    endMainLoop();
  });
  progress.show("waiting for " + address);
  runMainLoop();
  // After an interruption, stop() cancels the questions, and the second loop waits for the
  // incomplete answer.
  questions.stop();
  if (questions.pending() != 0) runMainLoop();
  progress.clear();
  return answer;
}

}  // namespace

int ask(const AskOptions& options) {
  const auto address = lookUpIPv4Address(options.address);
  if (!address) {
    std::cerr
        << "onramp-devices: " << inQuotes(options.address)
        << " is neither an IPv4 address nor the name of a host that has one; check the spelling\n";
    return kTrouble;
  }
  Progress progress;
  const Answer answer = askedAt(*address, progress);
  const int status = exitStatusOf(answer);
  if (options.json) {
    nlohmann::ordered_json object{{"version", 1}, {"address", *address}, {"status", status}};
    object["answer"] = jsonOfAnswer(answer);
    progress.print(printed(object));
  } else {
    progress.print(textOf(*address, answer, options.verbose));
  }
  return status;
}

}  // namespace onramp::devices

// onramp-devices explains which devices the wizard lists, and why it leaves out the others.

#include <CLI/CLI.hpp>
#include <clocale>
#include <exception>
#include <iostream>
#include <string>

#include "base/maker.h"
#include "platform/failed_writes.h"
#include "tools/devices/commands.h"

namespace {

using namespace onramp::devices;

// The examples of each command. The program's help shows the examples of all commands.
const std::string kBrowseExamples = R"(
  onramp-devices browse --medium /media/setup
      shows which devices the wizard lists, and why it leaves out the others
  onramp-devices browse --medium /media/setup --model "Kestrel Model 100" -v
      explains the list of a user who chose that model, and shows all that is known)";
const std::string kAskExamples = R"(
  onramp-devices ask 192.0.2.17
      shows what the device answers about its interface, byte for byte)";
const std::string kURIExamples = R"(
  onramp-devices uri "dnssd://Office%20Printer._ipp._tcp.local."
      shows the addresses behind a printer's URI)";
const std::string kHostsExamples = R"(
  onramp-devices hosts
      shows this computer's addresses, and which devices answer a broadcast)";

void addBrowse(CLI::App& app, BrowseOptions& options) {
  CLI::App* const command = app.add_subcommand(
      "browse", "Show the announced devices, and explain which of them the wizard lists");
  command->footer("Examples:" + kBrowseExamples);
  // If the option were required, CLI11 would report it as missing when it is only misspelt.
  command->add_option("-m,--medium", options.medium, "The folder that contains the application")
      ->type_name("DIR");
  command->add_option("--model", options.models, "Search only for this model; may be repeated")
      ->type_name("NAME")
      ->allow_extra_args(false);
  command->add_option("-s,--seconds", options.seconds, "How long to listen")
      ->capture_default_str()
      ->type_name("N")
      ->check(CLI::Range(0.1, 86400.0));
  command->add_flag("-a,--all-types", options.allTypes, "Also look for all other announced types");
  command->add_flag("--json", options.json, "Print JSON when the search is over");
  command->add_flag("-v,--verbose", options.verbose,
                    "Show records, TXT data and the SNMP exchanges");
}

void addAsk(CLI::App& app, AskOptions& options) {
  CLI::App* const command =
      app.add_subcommand("ask", "Ask one device by SNMP which interface it uses");
  command->add_option("ADDRESS", options.address, "The device's IPv4 address, or its host name")
      ->required();
  command->add_flag("--json", options.json, "Print JSON");
  command->add_flag("-v,--verbose", options.verbose, "Show the bytes of every attempt");
  command->footer("Exit status: 0 wireless, 1 not wireless, 2 no usable answer.\n\nExamples:" +
                  kAskExamples);
}

void addURI(CLI::App& app, URIOptions& options) {
  CLI::App* const command = app.add_subcommand("uri", "Show the addresses behind a device URI");
  command->footer("Examples:" + kURIExamples);
  command->add_option("URI", options.uri, "Such as \"dnssd://Office%20Printer._ipp._tcp.local.\"")
      ->required();
  command->add_option("-s,--seconds", options.seconds, "How long to wait for the addresses")
      ->capture_default_str()
      ->type_name("N")
      ->check(CLI::Range(0.1, 86400.0));
}

void addHosts(CLI::App& app, HostsOptions& options) {
  CLI::App* const command = app.add_subcommand(
      "hosts", "Show this computer's addresses, and the devices that answer a broadcast");
  command->footer("Examples:" + kHostsExamples);
  command->add_flag_callback(
      "-n,--no-search", [&options] { options.search = false; }, "Send no broadcasts");
  command->add_flag("--json", options.json, "Print JSON");
}

int run(int count, char* arguments[]) {
  CLI::App app("Explains which devices the wizard lists, and why it leaves out the others.");
  app.name("onramp-devices");
  app.footer("Examples:" + kBrowseExamples + kAskExamples + kURIExamples + kHostsExamples +
             "\n\n\"onramp-devices COMMAND --help\" shows a command's options.");
  app.set_version_flag("-V,--version", std::string("onramp-devices " ONRAMP_VERSION "\n") +
                                           onramp::maker::kSettings);
  app.require_subcommand(1);
  BrowseOptions browseOptions;
  AskOptions askOptions;
  URIOptions uriOptions;
  HostsOptions hostsOptions;
  addBrowse(app, browseOptions);
  addAsk(app, askOptions);
  addURI(app, uriOptions);
  addHosts(app, hostsOptions);
  try {
    const std::string first = count > 1 ? arguments[1] : "";
    const auto isFirst = [&](CLI::App* command) { return command->get_name() == first; };
    if (!first.empty() && !first.starts_with('-') && app.get_subcommands(isFirst).empty()) {
      throw CLI::ExtrasError(
          "there is no command \"" + first + "\"; the commands are browse, ask, uri and hosts",
          CLI::ExitCodes::ExtrasError);
    }
    app.parse(count, arguments);
    if (app.got_subcommand("browse") && browseOptions.medium.empty())
      throw CLI::RequiredError("--medium");
  } catch (const CLI::ParseError& error) {
    return app.exit(error) == 0 ? 0 : kTrouble;
  }
  if (app.got_subcommand("browse")) return browse(browseOptions);
  if (app.got_subcommand("ask")) return ask(askOptions);
  if (app.got_subcommand("uri")) return showURI(uriOptions);
  return showHosts(hostsOptions);
}

}  // namespace

int main(int count, char* arguments[]) {
  // columnsOf() needs the locale for the width of characters. Messages and numbers keep the form of
  // the "C" locale.
  std::setlocale(LC_CTYPE, "");
  onramp::surviveFailedWrites();
  try {
    const int status = run(count, arguments);
    if (std::cout.flush()) return status;
    std::cerr << "onramp-devices: the output could not be written; is its disk full?\n";
  } catch (const std::exception& error) {
    std::cerr << "onramp-devices: " << error.what() << '\n';
  }
  return kTrouble;
}

// onramp-check reads a finished medium as the wizard does, and reports what is wrong with it.

#include <CLI/CLI.hpp>
#include <clocale>
#include <cstdlib>
#include <exception>
#include <filesystem>
#include <iostream>
#include <set>
#include <string>
#include <system_error>

#include "base/maker.h"
#include "platform/terminal.h"
#include "tools/check/application.h"
#include "tools/check/check.h"
#include "tools/check/output.h"

namespace {

using namespace onramp;

constexpr int kFindings = 1;
constexpr int kUnreadable = 2;

constexpr const char* kFooter = R"(Examples:
  onramp-check /Volumes/Setup          print what is wrong with the medium
  onramp-check --json /Volumes/Setup   print the same as JSON, for a program

Exit status: 1 when an error or, with --strict, a warning was found; 2 when the
medium could not be read, the output could not be written or the command line is
wrong; otherwise 0.)";

bool isMedium(const std::filesystem::path& folder) {
  std::error_code ignored;
  const std::string application = check::findApplication(folder.string());
  return std::filesystem::is_directory(folder / "MacResources", ignored) ||
         (!application.empty() && check::isWizard(folder.string(), application));
}

// Returns why `folder` is not a medium, and which folder the user should give instead. Returns an
// empty string if it may be a medium.
std::string reasonAgainst(const std::string& folder) {
  namespace fs = std::filesystem;
  std::error_code error;
  const fs::path path = fs::canonical(folder, error);
  if (isMedium(path)) return "";
  for (fs::path above = path.parent_path(); above.has_relative_path();
       above = above.parent_path()) {
    if (isMedium(above))
      return "is only a part of a medium; give the whole medium, " + check::quoted(above.string());
  }
  std::set<std::string> media;
  fs::directory_iterator entry(path, error);
  for (; !error && entry != fs::directory_iterator(); entry.increment(error)) {
    if (isMedium(entry->path())) media.insert(entry->path().string());
  }
  if (!media.empty())
    return "contains a medium, but is not one; give " + check::quoted(*media.begin());
  return "contains neither the wizard nor MacResources; give the medium's folder";
}

// Returns `status` if standard output could be written. Otherwise prints a message and returns
// kUnreadable.
int finish(int status) {
  if (std::cout.flush()) return status;
  std::cerr << "onramp-check: the output could not be written; is its disk full?\n";
  return kUnreadable;
}

int run(int count, char* arguments[]) {
  CLI::App app(
      "Checks a finished medium: reports what is wrong with it and what its users will see.");
  app.name("onramp-check");
  app.footer(kFooter);
  app.set_version_flag("-V,--version",
                       std::string("onramp-check " ONRAMP_VERSION "\n") + maker::kSettings);
  std::string medium;
  bool json = false;
  bool strict = false;
  bool keys = false;
  bool texts = false;
  CLI::Option* const place =
      app.add_option("MEDIUM", medium, "The folder that contains the application");
  app.add_flag("--json", json, "Print JSON");
  app.add_flag("--strict", strict, "Exit with status 1 even if there are only warnings");
  app.add_flag("--keys", keys, "Print the keys that the wizard reads from property lists")
      ->excludes(place);
  app.add_flag("--texts", texts, "Print the keys of the texts that the wizard shows")
      ->excludes(place);
  try {
    app.parse(count, arguments);
  } catch (const CLI::ParseError& error) {
    return app.exit(error) == 0 ? 0 : kUnreadable;
  }
  if (keys || texts) {
    if (keys) check::writeKeys(std::cout);
    if (texts) check::writeTexts(std::cout);
    return finish(EXIT_SUCCESS);
  }
  std::error_code ignored;
  if (!std::filesystem::is_directory(medium, ignored)) {
    std::cerr << "onramp-check: "
              << (medium.empty() ? "MEDIUM is missing" : check::quoted(medium) + " is not a folder")
              << "; give the folder that contains the application\n";
    return kUnreadable;
  }
  if (std::filesystem::directory_iterator(medium, ignored); ignored) {
    std::cerr << "onramp-check: " << check::quoted(medium)
              << " cannot be read: " << ignored.message() << '\n';
    return kUnreadable;
  }
  if (const std::string reason = reasonAgainst(medium); !reason.empty()) {
    std::cerr << "onramp-check: " << check::quoted(medium) << ' ' << reason << '\n';
    return kUnreadable;
  }
  const check::Report report = check::checkMedium(medium);
  if (json) {
    check::writeJSON(std::cout, report);
  } else {
    check::writeText(std::cout, report, isOutputTerminal() ? terminalWidth() : 0);
  }
  const bool clean = report.count(check::Severity::kError) == 0 &&
                     !(strict && report.count(check::Severity::kWarning) != 0);
  return finish(clean ? EXIT_SUCCESS : kFindings);
}

}  // namespace

int main(int count, char* arguments[]) {
  std::setlocale(LC_CTYPE, "");  // columnsOf() needs it
  try {
    return run(count, arguments);
  } catch (const std::exception& error) {
    std::cerr << "onramp-check: " << error.what() << '\n';
    return kUnreadable;
  }
}

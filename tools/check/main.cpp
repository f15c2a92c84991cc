// onramp-check: reads a finished medium as the wizard does and says what is wrong with it.

#include <CLI/CLI.hpp>
#include <exception>
#include <filesystem>
#include <iostream>
#include <string>

namespace {

constexpr int kUnreadable = 2;

constexpr const char* kFooter = R"(Examples:
  onramp-check /Volumes/Setup          what is wrong with the medium there
  onramp-check --json build/medium     the same for a program

Exit status: 0 when the medium is clean, 1 when something was found, 2 when the
medium could not be read or the command line is wrong.)";

int run(int count, char* arguments[]) {
  CLI::App app("Checks a finished medium: what its users will see, and what is wrong with it.");
  app.name("onramp-check");
  app.footer(kFooter);
  app.set_version_flag("-V,--version", "onramp-check " ONRAMP_VERSION);
  std::string medium;
  bool json = false;
  bool strict = false;
  app.add_option("MEDIUM", medium, "The folder that the application lies in")->required();
  app.add_flag("--json", json, "Print JSON");
  app.add_flag("--strict", strict, "Exit with 1 for warnings, too");
  try {
    app.parse(count, arguments);
  } catch (const CLI::ParseError& error) {
    return app.exit(error) == 0 ? 0 : kUnreadable;
  }
  if (!std::filesystem::is_directory(medium)) {
    std::cerr << "onramp-check: \"" << medium
              << "\" is no folder; give the folder that holds the application\n";
    return kUnreadable;
  }
  std::cout << medium << ": a folder\n";
  return 0;
}

}  // namespace

int main(int count, char* arguments[]) {
  try {
    return run(count, arguments);
  } catch (const std::exception& error) {
    std::cerr << "onramp-check: " << error.what() << '\n';
    return kUnreadable;
  }
}

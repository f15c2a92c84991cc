#include <gtest/gtest.h>
#include <sys/stat.h>
#include <sys/wait.h>

#include <chrono>
#include <filesystem>
#include <fstream>
#include <thread>

#include "platform/child_process.h"
#include "platform/failed_writes.h"
#include "platform/folders.h"
#include "platform/standin/stand_in_system.h"
#include "platform/system_version.h"
#include "platform/user_locale.h"
#include "platform/workspace.h"
#include "tests/recording/medium_folder.h"

namespace onramp {
namespace {

using Environment = std::vector<std::pair<const char*, const char*>>;

TEST(Desktop, TakesLanguageAndCountryFromTheLocaleVariables) {
  const std::tuple<Environment, const char*, const char*, std::vector<std::string>> cases[] = {
      {{{"LANG", "ja_JP.UTF-8"}}, "ja", "JP", {"ja_JP"}},
      {{{"LANG", "ja_JP"}, {"LC_MESSAGES", "de_DE@euro"}}, "de", "DE", {"de_DE"}},
      {{{"LANG", "ja_JP"}, {"LC_MESSAGES", "de_DE"}, {"LC_ALL", "fr_CA"}}, "fr", "CA", {"fr_CA"}},
      {{{"LANG", "ja_JP"}, {"LC_ALL", ""}}, "ja", "JP", {"ja_JP"}},
      {{{"LANG", "de_CH"}, {"LANGUAGE", "de_AT:fr"}}, "de", "AT", {"de_AT", "fr", "de_CH"}},
      {{{"LANG", "de_CH"}, {"LANGUAGE", "fr"}}, "fr", "CH", {"fr", "de_CH"}},
      {{{"LANG", "zh_TW"}, {"LANGUAGE", "::?:"}}, "zh", "TW", {"zh_TW"}},
      {{{"LANG", "C.UTF-8"}, {"LANGUAGE", "fr"}}, "en", "", {"en"}},
      {{{"LANG", "ja_JP"}, {"LC_ALL", "POSIX"}}, "en", "", {"en"}},
      {{{"LANG", "de"}}, "de", "", {"de"}},
      {{{"LANG", "nonsense"}}, "en", "", {"en"}},
      {{{"LANG", ""}}, "en", "", {"en"}}};
  for (const auto& [environment, language, country, preferred] : cases) {
    recording::MediumFolder medium;
    for (const auto& [name, value] : environment)
      medium.setEnvironment(name, value);
    const std::string trace = testing::PrintToString(environment);
    EXPECT_EQ(localeLanguageCode(), language) << trace;
    EXPECT_EQ(localeCountryCode(), country) << trace;
    EXPECT_EQ(preferredLanguages(), preferred) << trace;
  }
}

TEST(Desktop, KeepsApplicationSupportInTheXDGFolders) {
  recording::MediumFolder medium;
  const std::string home = medium.path("home");
  medium.setEnvironment("HOME", home);
  medium.setEnvironment("XDG_DATA_HOME", medium.path("data/"));
  EXPECT_EQ(applicationSupportFolder(FolderDomain::kUser), medium.path("data"));
  EXPECT_TRUE(std::filesystem::is_directory(medium.path("data")));
  for (const char* const unusable : {"", "relative/data"}) {
    medium.setEnvironment("XDG_DATA_HOME", unusable);
    EXPECT_EQ(applicationSupportFolder(FolderDomain::kUser), home + "/.local/share");
  }
  medium.setEnvironment("XDG_DATA_DIRS", ":relative:" + medium.path("a") + ":" + medium.path("b"));
  EXPECT_EQ(applicationSupportFolder(FolderDomain::kLocal), medium.path("a"));
  EXPECT_FALSE(std::filesystem::exists(medium.path("b")));
  medium.setEnvironment("XDG_DATA_DIRS", std::nullopt);
  EXPECT_EQ(applicationSupportFolder(FolderDomain::kLocal), "/usr/local/share");
}

TEST(Desktop, OpensWithoutWaitingAndLeavesNoZombie) {
  recording::MediumFolder medium;
  const std::string gate = medium.path("gate");
  const std::string opened = medium.path("opened");
  // This xdg-open, the opener, waits for input from the pipe `gate`. Then it writes to `opened` the
  // number of its arguments, the first argument, and whether it leads its own session.
  medium.write("bin/xdg-open", "#!/bin/sh\ntimeout 60 cat '" + gate +
                                   "' > /dev/null\nwords=\"$#:$1\"\n" +
                                   "read -r line < /proc/$$/stat\nset -- $line\n" +
                                   "[ \"$6\" = $$ ] && words=\"$words:own session\"\n" +
                                   "printf '%s\\n' \"$words\" > '" + opened + ".part'\n" + "mv '" +
                                   opened + ".part' '" + opened + "'\n");
  medium.makeExecutable("bin/xdg-open");
  medium.setEnvironment("PATH", medium.path("bin") + ":" + std::getenv("PATH"));
  ASSERT_EQ(mkfifo(gate.c_str(), 0600), 0);
  const auto throughTheGate = [&] {
    EXPECT_FALSE(std::filesystem::exists(opened)) << "the call does not wait for the opener";
    std::ofstream(gate) << "go";
    for (int i = 0; i < 1000 && !std::filesystem::exists(opened); ++i)
      std::this_thread::sleep_for(std::chrono::milliseconds(10));
    std::string line;
    std::getline(std::ifstream(opened), line);
    std::filesystem::remove(opened);
    return line;
  };
  EXPECT_TRUE(openFile("/a folder/-it's \"the\" $package.pkg"));
  EXPECT_EQ(throughTheGate(), "1:/a folder/-it's \"the\" $package.pkg:own session");
  EXPECT_TRUE(openFile("-v"));
  EXPECT_EQ(throughTheGate(), "1:./-v:own session");
  EXPECT_TRUE(openURL("http://support.kestrel.example/?a=b&c=d"));
  EXPECT_EQ(throughTheGate(), "1:http://support.kestrel.example/?a=b&c=d:own session");
  EXPECT_FALSE(openURL("--help"));

  const auto hasChildren = [] {
    siginfo_t child{};
    return waitid(P_ALL, 0, &child, WEXITED | WNOHANG | WNOWAIT) == 0;
  };
  for (int i = 0; i < 1000 && hasChildren(); ++i)
    std::this_thread::sleep_for(std::chrono::milliseconds(10));
  EXPECT_FALSE(hasChildren());
}

TEST(Desktop, OpensNothingIfXdgOpenCannotBeRun) {
  recording::MediumFolder medium;
  medium.write("bin/xdg-open", std::string("not executable"));
  for (const std::string& path : {medium.path("bin") + ":", std::string()}) {
    medium.setEnvironment("PATH", path);
    EXPECT_FALSE(openFile("/package.pkg"));
    EXPECT_FALSE(openURL("http://support.kestrel.example/"));
  }
}

TEST(Desktop, StartsProgramsWithNoSignalIgnored) {
  surviveFailedWrites();
  EXPECT_EQ(runAndWait("/usr/bin/grep", {"-q", "^SigIgn:.*0000000$", "/proc/self/status"}), 0);
}

TEST(Desktop, ReportsTheSystemVersionThatIsSet) {
  recording::MediumFolder medium;
  const std::pair<const char*, std::int32_t> cases[] = {
      {"10.6.8", 0x1068},  {"10.3.9", 0x1039},  {"10.15.7", 0x1097}, {"10.9", 0x1090},
      {"11.0.0", 0x1100},  {"14.6.10", 0x1469}, {"9.2.2", 0x922},    {"101.0.0", 0x10100},
      {"10.-3.x", 0x1000}, {"system", 0},       {"10..5", 0x1005}};
  for (const auto& [version, selector] : cases) {
    medium.setEnvironment("ONRAMP_SYSTEM_VERSION", version);
    EXPECT_EQ(productVersion(), version);
    EXPECT_EQ(gestaltSystemVersion(), selector) << version;
  }
  for (const auto& absent : {std::optional<std::string>(), std::optional<std::string>("")}) {
    medium.setEnvironment("ONRAMP_SYSTEM_VERSION", absent);
    EXPECT_EQ(productVersion(), "10.15.7");
  }
  setSystemVersion("10.6.8");
  medium.setEnvironment("ONRAMP_SYSTEM_VERSION", "10.9.5");
  EXPECT_EQ(productVersion(), "10.6.8")
      << "setSystemVersion() takes precedence over the environment";
  setSystemVersion("");
  EXPECT_EQ(productVersion(), "10.9.5");
}

}  // namespace
}  // namespace onramp

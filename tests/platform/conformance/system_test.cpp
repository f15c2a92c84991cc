#include <gtest/gtest.h>

#include <chrono>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <thread>

#include "platform/bundle.h"
#include "platform/child_process.h"
#include "platform/folders.h"
#include "platform/property_list.h"
#include "platform/user_locale.h"
#include "platform/workspace.h"
#include "tests/recording/temporary_folder.h"

namespace onramp {
namespace {

namespace fs = std::filesystem;

std::string holding(const TemporaryFolder& folder, const std::string& name,
                    const std::string& bytes) {
  fs::create_directories(fs::path(folder / name).parent_path());
  return folder.holding(name, bytes);
}

std::string program(const TemporaryFolder& folder, const std::string& name,
                    const std::string& commands) {
  std::string path = holding(folder, name, "#!/bin/sh\n" + commands + "\n");
  fs::permissions(path, fs::perms::owner_all);
  return path;
}

TEST(UserLocale, IsTheOneThatCTestSets) {
  EXPECT_EQ(localeLanguageCode(), "zh");
  EXPECT_EQ(localeCountryCode(), "CN");
  const std::vector<std::string> languages = preferredLanguages();
  ASSERT_FALSE(languages.empty());
  EXPECT_EQ(languages.front(), "zh_CN");
}

TEST(Folders, AreAbsoluteAndTheUsersIsCreated) {
  const std::string user = applicationSupportFolder(FolderDomain::kUser);
  EXPECT_TRUE(fs::is_directory(user)) << user;
  for (const std::string& folder : {user, applicationSupportFolder(FolderDomain::kLocal)}) {
    EXPECT_TRUE(folder.starts_with('/')) << folder;
    EXPECT_FALSE(folder.ends_with('/')) << folder;
  }
}

TEST(ChildProcess, ReportsHowItEnded) {
  const TemporaryFolder folder;
  EXPECT_EQ(runAndWait(program(folder, "a", "exit 0"), {}), 0);
  EXPECT_EQ(
      runAndWait(program(folder, "b", "[ \"$#:$1\" = '1:-installer' ] && exit 2"), {"-installer"}),
      2);
  EXPECT_EQ(runAndWait(program(folder, "c", "kill -9 $$"), {}), std::nullopt);
  EXPECT_EQ(runAndWait(folder / "absent", {}), std::nullopt);
  EXPECT_EQ(runAndWait(folder.holding("text", "no program"), {}), std::nullopt);
  EXPECT_EQ(runAndWait(folder / "", {}), std::nullopt);
}

// ctest puts the folder "bin" first on the path. Its xdg-open stands in for the desktop's opener.
TEST(Workspace, OpensWithoutWaitingForTheOpener) {
  const std::string home = std::getenv("HOME");
  for (const char* const name : {"/go", "/opened"})
    fs::remove(home + name);
  EXPECT_TRUE(openURL("http://support.kestrel.example/?a=b&c=d"));
  EXPECT_FALSE(fs::exists(home + "/opened"));
  std::ofstream(home + "/go") << "go";
  for (int i = 0; i < 1000 && !fs::exists(home + "/opened"); ++i)
    std::this_thread::sleep_for(std::chrono::milliseconds(10));
  std::string opened;
  std::getline(std::ifstream(home + "/opened"), opened);
  EXPECT_EQ(opened, "http://support.kestrel.example/?a=b&c=d");
}

TEST(Bundle, UsesTheUsersLanguageOrElseEnglish) {
  struct Case {
    std::vector<std::string> offered;
    const char* expected;
  };
  const Case cases[] = {
      {{"English", "ja", "zh_CN"}, "zh_CN"}, {{"de", "en"}, "en"}, {{"English", "ja"}, "English"}};
  for (const Case& c : cases) {
    const TemporaryFolder folder;
    for (const std::string& language : c.offered) {
      holding(folder, "Some.bundle/Contents/Resources/" + language + ".lproj/Localizable.strings",
              "\"k\" = \"" + language + "\";");
    }
    ASSERT_TRUE(writeDictionaryAtomically(Dictionary{{"CFBundleName", "Some"}},
                                          folder / "Some.bundle/Contents/Info.plist"));
    const auto bundle = Bundle::open(folder / "Some.bundle");
    ASSERT_TRUE(bundle);
    EXPECT_EQ(bundle->localizedString("k", "fallback", std::nullopt), c.expected)
        << testing::PrintToString(c.offered);
    EXPECT_EQ(bundle->localizedString("absent", "fallback", std::nullopt), "fallback");
    EXPECT_EQ(bundle->localizedString("k", "fallback", "Other"), "fallback");
  }
}

TEST(Bundle, FindsItsFiles) {
  const TemporaryFolder folder;
  EXPECT_FALSE(Bundle::open(folder / "absent"));
  const std::string contents = folder / "Some.bundle/Contents/";
  for (const char* const name :
       {"Picture.png", "zh_CN.lproj/Picture.png", "zh_CN.lproj/Own.png", "noextension"}) {
    holding(folder, "Some.bundle/Contents/Resources/" + std::string(name), "");
  }
  holding(folder, "Some.bundle/Contents/MacOS/tool", "");
  ASSERT_TRUE(writeDictionaryAtomically(Dictionary{{"CFBundleExecutable", "tool"}, {"Number", 5}},
                                        contents + "Info.plist"));
  const auto bundle = Bundle::open(folder / "Some.bundle");
  ASSERT_TRUE(bundle);
  EXPECT_EQ(bundle->path(), folder / "Some.bundle");
  EXPECT_EQ(bundle->pathForResource("Picture", "png"), contents + "Resources/Picture.png");
  EXPECT_EQ(bundle->pathForResource("Own", "png"), contents + "Resources/zh_CN.lproj/Own.png");
  EXPECT_EQ(bundle->pathForResource("noextension", ""), contents + "Resources/noextension");
  EXPECT_EQ(bundle->pathForResource("absent", "png"), std::nullopt);
  EXPECT_EQ(bundle->executablePath(), contents + "MacOS/tool");
  EXPECT_EQ(bundle->infoString("CFBundleExecutable"), "tool");
  EXPECT_EQ(bundle->infoString("Number"), std::nullopt);
  EXPECT_EQ(bundle->infoDictionary().integerValue("Number"), 5);
}

}  // namespace
}  // namespace onramp

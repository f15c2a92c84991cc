#include <gtest/gtest.h>

#include <filesystem>

#include "platform/bundle.h"
#include "platform/child_process.h"
#include "platform/folders.h"
#include "platform/property_list.h"
#include "platform/user_locale.h"
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

TEST(UserLocale, IsTakenFromTheEnvironmentThatCTestSets) {
  EXPECT_EQ(localeLanguageCode() + localeCountryCode(), "zhCN");
  EXPECT_EQ(preferredLanguages().at(0), "zh_CN");
}

TEST(Folders, AreAbsoluteAndTheUsersFolderIsCreated) {
  const std::string user = applicationSupportFolder(FolderDomain::kUser);
  EXPECT_TRUE(fs::is_directory(user)) << user;
  for (const std::string& folder : {user, applicationSupportFolder(FolderDomain::kLocal)})
    EXPECT_TRUE(folder.starts_with('/') && !folder.ends_with('/')) << folder;
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

TEST(Bundle, FindsItsFilesAndTextsInTheUsersLanguage) {
  const TemporaryFolder folder;
  EXPECT_FALSE(Bundle::open(folder / "absent"));
  const std::string contents = folder / "Some.bundle/Contents/";
  for (const char* const name :
       {"Picture.png", "zh_CN.lproj/Picture.png", "zh_CN.lproj/Own.png", "noextension"}) {
    holding(folder, "Some.bundle/Contents/Resources/" + std::string(name), "");
  }
  holding(folder, "Some.bundle/Contents/MacOS/tool", "");
  for (const char* const language : {"en", "zh_CN"}) {
    holding(
        folder,
        std::string("Some.bundle/Contents/Resources/") + language + ".lproj/Localizable.strings",
        std::string("k = ") + language + ";");
  }
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
  EXPECT_EQ(bundle->localizedString("k", "fallback", std::nullopt), "zh_CN");
  EXPECT_EQ(bundle->localizedString("absent", "fallback", std::nullopt), "fallback");
  EXPECT_EQ(bundle->localizedString("k", "fallback", "Other"), "fallback");
}

}  // namespace
}  // namespace onramp

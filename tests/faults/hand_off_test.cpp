#include <gmock/gmock.h>

#include <filesystem>
#include <new>

#include "platform/property_list.h"
#include "platform/run_loop.h"
#include "tests/app/wizard.h"
#include "tests/faults/failures.h"

namespace onramp {
namespace {

namespace fs = std::filesystem;

using faults::failEveryCall;
using faults::Failure;

TEST(AtomicWriting, AFailureLeavesTheOldFileAndRemovalDeletesLeftovers) {
  const TemporaryFolder folder;
  const std::string longest(255, 'n');
  const std::string path = folder / longest;
  const Dictionary old{{"k", "before"}};
  const Dictionary next{{"k", Array{"after", std::string(40, 'x'), 5}}};
  bool isWritten = false;
  writeDictionaryAtomically(old, path);
  const auto seen = failEveryCall(
      {ENOMEM, EIO, ENOSPC, EDQUOT, EROFS, EACCES, EMFILE, EEXIST, EINTR},
      [&] {
        isWritten = false;
        try {
          isWritten = writeDictionaryAtomically(next, path);
        } catch (const std::bad_alloc&) {
        }
      },
      [&](const std::string& failed, const Failure& failure) {
        const bool isRepeated = (failed == "write" && failure.error == EINTR) ||
                                (failed == "open" && failure.error == EEXIST);
        EXPECT_EQ(isWritten, failed.empty() || (isRepeated && !failure.isLasting));
        EXPECT_EQ(loadDictionary(path), isWritten ? next : old);
        if (!failure.isLasting) {
          EXPECT_THAT(folder.names(), testing::ElementsAre(longest));
        }
        removeDictionary(path);
        EXPECT_THAT(folder.names(), testing::IsEmpty());
        writeDictionaryAtomically(old, path);
      });
  EXPECT_THAT(seen,
              testing::ElementsAre("close", "fsync", "new", "open", "rename", "unlink", "write"));
  failEveryCall(
      {EIO, EMFILE}, [&] { removeDictionary(path); },
      [&](const std::string& failed, const Failure& failure) {
        EXPECT_EQ(folder.names().empty(), !failure.isLasting || failed != "remove");
        writeDictionaryAtomically(old, path);
      });
}

using Faults = Wizard;

TEST_F(Faults, DoNotStopTheWizardOrLeaveHalfAFile) {
  describeTwoModels();
  const fs::path user = fs::path(medium.modelFilePath()).parent_path();
  const fs::path local = fs::path(medium.optionsFilePath()).parent_path();
  const auto expectWholeFiles = [&] {
    for (const auto& entry : fs::recursive_directory_iterator(medium.path("..")))
      EXPECT_TRUE(entry.is_directory() || loadDictionary(entry.path())) << entry.path();
  };
  const auto start = [&] {
    SetUp();
    launch();
  };
  start();
  const auto seen = failEveryCall(
      {EIO, EEXIST},
      [&] {
        chooseModel("Cable");
        screen.click("rightMostButton");
      },
      [&](const std::string& failed, const Failure& failure) {
        expectPackageOpenedAndQuit();
        EXPECT_TRUE(!failed.empty() || (medium.modelFile() && medium.optionsFile()));
        if (!failure.isLasting) expectWholeFiles();
        start();
        EXPECT_FALSE(medium.modelFile() || medium.optionsFile());
        expectWholeFiles();
        fs::remove_all(user);
        fs::remove_all(local);
      });
  EXPECT_THAT(seen, testing::IsSupersetOf({"fchmodat", "mkdir", "read", "stat"}));

  failEveryCall({EIO}, start, [&](const std::string&, const Failure&) {
    EXPECT_TRUE(screen.terminated || !screen.delays.empty() || !page().empty());
    expectWholeFiles();
    OnrampOSXAppDelegate::copyCDInfo();
  });
}

TEST_F(Faults, TheWizardWaitsWithTimersIfNoThreadCanStart) {
  describeTwoModels();
  launch();
  chooseModel("All");
  screen.click("rightMostButton");
  performOnMainThread([&] { screen.runTimers(); });
  faults::begin({1, EAGAIN, true});
  screen.click("rightMostButton");
  EXPECT_THAT(faults::end(), testing::Contains("pthread_create"));
  EXPECT_EQ(screen.delays, (std::vector<double>{2, 2, 2, 2, 2, 0.5}));
  EXPECT_EQ(buttons(), "[BTN_CANCEL][BTN_BACK][BTN_NEXT]");
  EXPECT_TRUE(delegate->windowShouldClose(Window()));
}

}  // namespace
}  // namespace onramp

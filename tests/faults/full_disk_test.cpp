// Runs as root in a new mount namespace; see tests/in_namespace.

#include <gtest/gtest.h>

#include <cstdlib>

#include "platform/property_list.h"
#include "tests/recording/temporary_folder.h"

namespace onramp {
namespace {

TEST(FullDisk, KeepsTheOldFileAndLeavesNoTemporaryFile) {
  const TemporaryFolder folder;
  const auto run = [&](const std::string& command) {
    EXPECT_EQ(std::system(("cd '" + folder / "' && " + command).c_str()), 0) << command;
  };
  // Each case has mount options and a command. Once the command has run, writing a list must fail.
  const std::pair<std::string, const char*> failures[] = {
      {"size=64k", "! head -c 1M /dev/zero > fill"},
      {"size=64k", "! head -c 1M /dev/zero > fill; truncate -s -8192 fill"},
      {"nr_inodes=9", "! touch 1 2 3 4 5 6 7 8"},
      {"size=64k", "mount -o remount,ro ."}};
  for (const auto& [options, command] : failures) {
    SCOPED_TRACE(command);
    run("mount -t tmpfs -o " + options + " tmpfs \"$PWD\"");
    const Dictionary before{{"k", "before"}};
    EXPECT_TRUE(writeDictionaryAtomically(before, folder / "list"));
    run(command);
    const auto names = folder.names();
    EXPECT_FALSE(
        writeDictionaryAtomically(Dictionary{{"k", std::string(20000, 'x')}}, folder / "list"));
    EXPECT_EQ(loadDictionary(folder / "list"), before);
    EXPECT_EQ(folder.names(), names) << "a temporary file was left";
    run("umount -l \"$PWD\"");
  }
}

}  // namespace
}  // namespace onramp

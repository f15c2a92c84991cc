#include "platform/property_list.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <clocale>
#include <functional>

#include "platform/child_process.h"
#include "platform/failed_writes.h"
#include "tests/recording/temporary_folder.h"

namespace onramp {
namespace {

std::string plist(const std::string& inside) {
  return "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
         "<!DOCTYPE plist PUBLIC \"-//Apple//DTD PLIST 1.0//EN\" "
         "\"http://www.apple.com/DTDs/PropertyList-1.0.dtd\">\n"
         "<plist version=\"1.0\"><dict>" +
         inside + "</dict></plist>\n";
}

std::string utf16(const std::string& ascii, bool bigEndian) {
  std::string bytes;
  for (const char c : ascii)
    bytes += bigEndian ? std::string{'\0', c} : std::string{c, '\0'};
  return bytes;
}

TEST(PropertyList, ReadsXMLInTheFormsThatPeopleWrite) {
  const Dictionary expected{{"k", "a<b"}};
  const std::pair<std::string, Dictionary> cases[] = {
      {plist("<key>k</key><string>a&lt;b</string>"), expected},
      {"\xEF\xBB\xBF" + plist("<key>k</key><string>a&lt;b</string>"), expected},
      {"\xFF\xFE" + utf16(plist("<key>k</key><string>a&lt;b</string>"), false), expected},
      {utf16(plist("<key>k</key><string>a&lt;b</string>"), true), expected},
      {"<plist><dict><key>k</key><string><![CDATA[a<b]]></string></dict></plist>", expected},
      {plist("<!-- <array> --><key>k</key><string>a<!-- > -->&#60;&#x62;</string>"), expected},
      {plist("<key>k</key>\n\t<integer>010</integer><key>m</key><integer> -09</integer>"
             "<key>h</key><integer>0x1F</integer><key>z</key><integer>00</integer>"),
       Dictionary{{"k", 10}, {"m", -9}, {"h", 31}, {"z", 0}}},
      {plist("<key>k</key><string/><key>t</key><true></true><key>d</key><dict/>"),
       Dictionary{{"k", ""}, {"t", true}, {"d", Dictionary()}}}};
  const TemporaryFolder folder;
  for (const auto& [text, dictionary] : cases)
    EXPECT_EQ(loadDictionary(folder.holding("list", text)), dictionary) << text;
}

TEST(PropertyList, ReadsTheSameNumbersInALocaleWithADecimalComma) {
  const TemporaryFolder folder;
  (void)runAndWait("/usr/bin/localedef", {"-i", "de_DE", "-f", "UTF-8", folder / "de_DE.UTF-8"});
  setenv("LOCPATH", (folder / "").c_str(), 1);
  if (!std::setlocale(LC_ALL, "de_DE.UTF-8")) GTEST_SKIP() << "Debian's package locales is missing";
  EXPECT_TRUE(writeDictionaryAtomically(Dictionary{{"real", 1234.5}}, folder / "list"));
  EXPECT_EQ(loadDictionary(folder / "list"), (Dictionary{{"real", 1234.5}}));
  std::setlocale(LC_ALL, "C");
  unsetenv("LOCPATH");
}

// Starts a process whose files may hold at most 1,024 bytes. The process calls `prepare` and writes
// a list of 5,000 bytes. Returns the process's wait status.
int statusOfWriterPastItsLimit(const std::string& path, const std::function<void()>& prepare) {
  const pid_t writer = fork();
  if (writer == 0) {
    const rlimit limit{1024, 1024};
    setrlimit(RLIMIT_FSIZE, &limit);
    prepare();
    _exit(writeDictionaryAtomically(Dictionary{{"k", std::string(5000, 'x')}}, path) ? 1 : 0);
  }
  int status = -1;
  EXPECT_EQ(waitpid(writer, &status, 0), writer);
  return status;
}

TEST(AtomicWriting, AFailureLeavesTheOldFileAndNothingElse) {
  const TemporaryFolder folder;
  const Dictionary before{{"k", "before"}};
  const std::string longest(255, 'n');
  for (const std::string& name : {std::string("list"), longest})
    ASSERT_TRUE(writeDictionaryAtomically(before, folder / name));
  std::filesystem::create_directory(folder / "taken");
  EXPECT_FALSE(writeDictionaryAtomically(before, folder / "taken"));
  EXPECT_FALSE(writeDictionaryAtomically(before, folder / "no folder/list"));

  EXPECT_EQ(statusOfWriterPastItsLimit(folder / "list", surviveFailedWrites), 0)
      << "the process was killed, or reported success";
  EXPECT_EQ(loadDictionary(folder / "list"), before);
  EXPECT_THAT(folder.names(), testing::UnorderedElementsAre("list", "taken", longest));
}

TEST(AtomicWriting, AKilledWriterKeepsTheOldFileAndRemovalDeletesItsLeftovers) {
  const TemporaryFolder folder;
  const Dictionary before{{"k", "before"}};
  const std::string longest(255, 'n');
  for (const std::string& name : {std::string("list"), longest}) {
    ASSERT_TRUE(writeDictionaryAtomically(before, folder / name));
    EXPECT_TRUE(WIFSIGNALED(statusOfWriterPastItsLimit(folder / name, [] {})));
    EXPECT_EQ(folder.names().size(), 2U) << "the list and the unfinished new one";
    EXPECT_EQ(loadDictionary(folder / name), before);
    removeDictionary(folder / name);
    EXPECT_THAT(folder.names(), testing::IsEmpty());
  }
}

TEST(FailedWrites, ABrokenPipeDoesNotEndTheProcess) {
  const pid_t writer = fork();
  if (writer == 0) {
    surviveFailedWrites();
    int ends[2];
    if (pipe(ends) == 0) close(ends[0]);
    _exit(write(ends[1], "!", 1) == -1 ? 0 : 1);
  }
  int status = -1;
  ASSERT_EQ(waitpid(writer, &status, 0), writer);
  EXPECT_EQ(status, 0);
}

}  // namespace
}  // namespace onramp

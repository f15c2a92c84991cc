#include "platform/property_list.h"

#include <gtest/gtest.h>
#include <sys/resource.h>
#include <unistd.h>

#include <clocale>

#include "platform/child_process.h"
#include "platform/failed_writes.h"
#include "tests/platform/in_process.h"
#include "tests/platform/plist.h"
#include "tests/recording/temporary_folder.h"

namespace onramp {
namespace {

std::string utf16(const std::string& ascii, bool bigEndian) {
  std::string bytes;
  for (const char c : ascii)
    bytes += bigEndian ? std::string{'\0', c} : std::string{c, '\0'};
  return bytes;
}

TEST(PropertyList, ReadsXMLInTheFormsThatPeopleWrite) {
  const Dictionary expected{{"k", "a<b"}};
  const std::pair<std::string, Dictionary> cases[] = {
      {plistWith("<string>a&lt;b</string>"), expected},
      {"\xEF\xBB\xBF" + plistWith("<string>a&lt;b</string>"), expected},
      {"\xFF\xFE" + utf16(plistWith("<string>a&lt;b</string>"), false), expected},
      {utf16(plistWith("<string>a&lt;b</string>"), true), expected},
      {"<plist><dict><key>k</key><string><![CDATA[a<b]]></string></dict></plist>", expected},
      {plistWith("<!-- <array> --><string>a<!-- > -->&#60;&#x62;</string>"), expected},
      {plistWith("\n\t<integer>010</integer><key>m</key><integer> -09</integer>"
                 "<key>h</key><integer>0x1F</integer><key>z</key><integer>00</integer>"),
       Dictionary{{"k", 10}, {"m", -9}, {"h", 31}, {"z", 0}}},
      {plistWith("<string/><key>t</key><true></true><key>d</key><dict/>"),
       Dictionary{{"k", ""}, {"t", true}, {"d", Dictionary()}}}};
  const TemporaryFolder folder;
  for (const auto& [text, dictionary] : cases)
    EXPECT_EQ(loadDictionary(folder.holding("list", text)), dictionary) << text;
}

TEST(PropertyList, ReadsTheSameNumbersInALocaleWithADecimalComma) {
  const TemporaryFolder folder;
  if (runAndWait("/usr/bin/localedef", {"-i", "de_DE", "-f", "UTF-8", folder / "de_DE.UTF-8"}) != 0)
    GTEST_SKIP() << "Debian's package locales is missing";
  EXPECT_EQ(inProcess([&] {
              setenv("LOCPATH", (folder / "").c_str(), 1);
              const Dictionary list{{"real", 1234.5}};
              return std::setlocale(LC_ALL, "de_DE.UTF-8") &&
                     writeDictionaryAtomically(list, folder / "list") &&
                     loadDictionary(folder / "list") == list;
            }),
            0);
}

TEST(FailedWrites, NeitherABrokenPipeNorTheLimitOnFileSizesEndsTheProcess) {
  const TemporaryFolder folder;
  EXPECT_EQ(inProcess([&] {
              surviveFailedWrites();
              const rlimit limit{1024, 1024};
              setrlimit(RLIMIT_FSIZE, &limit);
              const Dictionary large{{"k", std::string(5000, 'x')}};
              int ends[2];
              if (pipe(ends) == 0) close(ends[0]);
              return !writeDictionaryAtomically(large, folder / "list") &&
                     write(ends[1], "!", 1) == -1;
            }),
            0);
}

}  // namespace
}  // namespace onramp

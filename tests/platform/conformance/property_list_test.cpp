#include "platform/property_list.h"

#include <gtest/gtest.h>
#include <sys/stat.h>

#include <limits>

#include "platform/child_process.h"
#include "tests/platform/plist.h"
#include "tests/recording/temporary_folder.h"

namespace onramp {
namespace {

Data allBytes() {
  Data data;
  for (int i = 0; i < 256; ++i)
    data.push_back(static_cast<std::byte>(i));
  return data;
}

TEST(PropertyList, ExchangesEveryKindOfValueWithAnotherImplementation) {
  const TemporaryFolder folder;
  ASSERT_EQ(runAndWait(PYTHON, {PEER, "write", folder / "xml", folder / "binary"}), 0);
  const auto read = loadDictionary(folder / "binary");
  const auto fromXML = loadDictionary(folder / "xml");
  ASSERT_TRUE(read && fromXML);
  // Python's XML writer turns carriage returns into line feeds.
  EXPECT_EQ(fromXML->with("carriage return", "a\rb\r\n"), *read);

  ASSERT_TRUE(writeDictionaryAtomically(read->with("not for XML", "bell \a, broken \xFF\xC3"),
                                        folder / "written"));
  EXPECT_EQ(runAndWait(PYTHON, {PEER, "check", folder / "written"}), 0);
  EXPECT_EQ(loadDictionary(folder / "written"), *read);

  // The checks above would miss an error in reading that writing reverses.
  const Dictionary known{{"true", true},
                         {"least", std::numeric_limits<std::int64_t>::min()},
                         {"greatest", std::numeric_limits<std::uint64_t>::max()},
                         {"small", -5e-324},
                         {"infinite", std::numeric_limits<double>::infinity()},
                         {"Schlüssel 鍵 🖨", "Größe 大きさ 🖨"},
                         {"data", allBytes()},
                         {"day", Date{730902896}},
                         {"first", Date{-63113904000}},
                         {"list", Array{1, Array{2, Array{"three"}}, Dictionary{{"four", 4}}}}};
  for (const auto& [key, value] : known) {
    const Value* const found = read->find(key);
    EXPECT_TRUE(found && *found == value) << key;
  }
}

TEST(PropertyList, IsNothingWhenTheFileHoldsAnythingElse) {
  const std::string whole = plistWith("<string>text</string>");
  const std::string cases[] = {"",
                               "plain text",
                               "<",
                               "<plist version=\"1.0\"><array/></plist>",
                               "<plist><string>text</string></plist>",
                               "<html><body/></html>",
                               whole.substr(0, whole.size() - 12),
                               plistWith("\xFF"),
                               "bplist00",
                               "bplist00" + std::string(40, '\xFF')};
  const TemporaryFolder folder;
  for (const std::string& bytes : cases)
    EXPECT_EQ(loadDictionary(folder.holding("list", bytes)), std::nullopt) << bytes;
  EXPECT_EQ(loadDictionary(folder / "absent"), std::nullopt);
  EXPECT_EQ(loadDictionary(folder / "."), std::nullopt);
  EXPECT_EQ(mkfifo((folder / "pipe").c_str(), 0600), 0);
  EXPECT_EQ(loadDictionary(folder / "pipe"), std::nullopt)
      << "reading a pipe without a writer does not block";
}

TEST(PropertyList, IsNothingWhenItsXMLIsNotWellFormed) {
  const TemporaryFolder folder;
  for (const std::string& text : {std::string("\0", 1), std::string("&unknown;")}) {
    const std::string bytes = plistWith("<string>" + text + "</string>");
    EXPECT_EQ(loadDictionary(folder.holding("list", bytes)), std::nullopt) << bytes;
  }
}

TEST(PropertyList, IsWrittenWholeOrNotAtAll) {
  const TemporaryFolder folder;
  const Dictionary before{{"k", "before"}};
  EXPECT_TRUE(writeDictionaryAtomically(before, folder / "list"));
  std::filesystem::create_directories(folder / "taken/inside");
  EXPECT_FALSE(writeDictionaryAtomically(before, folder / "taken"));
  EXPECT_FALSE(writeDictionaryAtomically(before, folder / "absent/list"));
  EXPECT_EQ(folder.names().size(), 2U) << "a write that fails leaves no temporary file";
  EXPECT_TRUE(writeDictionaryAtomically(before.with("k", "after"), folder / "list"));
  EXPECT_EQ(loadDictionary(folder / "list"), before.with("k", "after"));
  removeDictionary(folder / "list");
  removeDictionary(folder / "taken");
  removeDictionary(folder / "absent");
  EXPECT_TRUE(folder.names().empty());
}

}  // namespace
}  // namespace onramp

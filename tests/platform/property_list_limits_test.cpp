#include "platform/property_list.h"
#include "tests/platform/in_process.h"
#include "tests/platform/plist.h"
#include "tests/recording/temporary_folder.h"

namespace onramp {
namespace {

std::string repeated(const std::string& text, std::size_t times) {
  std::string result;
  for (std::size_t i = 0; i < times; ++i)
    result += text;
  return result;
}

std::string bigEndian(std::size_t number, int bytes = 4) {
  std::string text(static_cast<std::size_t>(bytes), '\0');
  for (auto byte = text.rbegin(); byte != text.rend(); ++byte, number >>= 8U)
    *byte = static_cast<char>(number & 0xFF);
  return text;
}

// Returns a binary property list of `objects`, the first of which is the root.
std::string binary(const std::vector<std::string>& objects, int offsetSize = 4,
                   int referenceSize = 4) {
  std::string bytes = "bplist00";
  std::string offsets;
  for (const std::string& object : objects) {
    offsets += bigEndian(bytes.size(), offsetSize);
    bytes += object;
  }
  const std::size_t table = bytes.size();
  const std::string sizes{static_cast<char>(offsetSize), static_cast<char>(referenceSize)};
  return bytes + offsets + std::string(6, '\0') + sizes + bigEndian(objects.size(), 8) +
         bigEndian(0, 8) + bigEndian(table, 8);
}

// Returns a binary list whose root is a dictionary with one value, object 2. Besides the dictionary
// and its key, the list has `count` objects, numbered from 2. `object(i)` returns the bytes of
// object i.
std::string dictionaryOver(std::size_t count,
                           const std::function<std::string(std::size_t)>& object) {
  std::vector<std::string> objects{"\xD1" + bigEndian(1) + bigEndian(2), "\x51k"};
  for (std::size_t i = 2; i < count + 2; ++i)
    objects.push_back(object(i));
  return binary(objects);
}

// Returns a binary list of `depth` nested arrays. Each array contains the next one `times` times.
// The innermost array contains a string `times` times.
std::string arrays(std::size_t depth, std::size_t times) {
  return dictionaryOver(depth + 1, [&](std::size_t i) {
    return i == depth + 2 ? std::string("\x51t")
                          : static_cast<char>(0xA0 + times) + repeated(bigEndian(i + 1), times);
  });
}

TEST(Limits, AHostileFileIsRefusedAtLittleCost) {
  const TemporaryFolder folder;
  const std::pair<const char*, std::string> cases[] = {
      {"XML nested 200,000 deep",
       plistWith(repeated("<array>", 200000) + repeated("</array>", 200000))},
      {"XML nested behind comments that seem to close it",
       plistWith(repeated("<array><!--</array>-->", 100000) + repeated("</array>", 100000))},
      {"XML nested behind what seems to be an instruction",
       "<?>" + plistWith(repeated("<array>", 100000) + repeated("</array>", 100000)) + "?>"},
      {"a document type with an internal part",
       "<!DOCTYPE plist [<!ENTITY a \"b\">]>" + plistWith("<true/>")},
      {"two million elements", plistWith("<array>" + repeated("<true/>", 2000000) + "</array>")},
      {"a text of a million entities",
       plistWith("<string>" + repeated("&amp;", 1000000) + "</string>")},
      {"a dictionary of 100,000 equal keys",
       plistWith("<dict>" + repeated("<key>aa</key><true/>", 100000) + "</dict>")},
      {"a file of 17 MiB", plistWith("<string>" + std::string(17 << 20, 'x') + "</string>")},
      {"shared references that grow to 10^13 objects", arrays(13, 10)},
      {"binary lists nested 100,000 deep", arrays(100000, 1)},
      {"a shared text that grows to 200 GB",
       dictionaryOver(3,
                      [](std::size_t i) {
                        return i == 2
                                   ? "\xAF\x12" + bigEndian(200000, 4) +
                                         repeated(bigEndian(3), 200000)
                                   : "\x5F\x12" + bigEndian(1000000, 4) + std::string(1000000, 'x');
                      })},
      {"two arrays that hold each other",
       dictionaryOver(2, [](std::size_t i) { return "\xA1" + bigEndian(5 - i); })}};
  // Loads each file in a new process, so that the process's peak memory shows the cost of loading.
  rusage usage{};
  const auto load = [&](const std::string& bytes) {
    const std::string path = folder.holding("list", bytes);
    return inProcess([&] { return loadDictionary(path).has_value(); }, &usage);
  };
  EXPECT_EQ(load(plistWith("<true/>")), 0);
  const long usual = usage.ru_maxrss;
  for (const auto& [name, bytes] : cases) {
    EXPECT_EQ(load(bytes), W_EXITCODE(1, 0)) << name;
    EXPECT_LT(usage.ru_maxrss - usual, 32 * 1024) << name;
  }
}

TEST(Limits, LeaveRoomForTheListsOfRealMedia) {
  const TemporaryFolder folder;
  std::string models;
  for (int i = 0; i < 20000; ++i) {
    models += "<key>Model " + std::to_string(i) +
              "</key><dict><key>KSCID</key><string>k</string><key>Interfaces</key><dict>"
              "<key>USB</key><true/></dict></dict>";
  }
  const std::pair<const char*, std::string> cases[] = {
      {"20,000 models", plistWith("<dict>" + models + "</dict>")},
      {"lists 100 deep", plistWith(repeated("<array>", 100) + repeated("</array>", 100))},
      {"binary lists 100 deep", arrays(100, 1)},
      {"shared references", arrays(4, 14)},
      {"a long text with entities",
       plistWith("<string>" + repeated("text &amp; text ", 1000) + "</string>")}};
  for (const auto& [name, bytes] : cases)
    EXPECT_TRUE(loadDictionary(folder.holding("list", bytes))) << name;
}

TEST(Limits, OffsetsAndReferencesTakeOneToEightBytes) {
  const TemporaryFolder folder;
  for (int size = 1; size <= 9; ++size) {
    for (const auto& [offsets, references] : {std::pair(size, 1), std::pair(2, size)}) {
      const std::string bytes =
          binary({"\xD1" + bigEndian(1, references) + bigEndian(2, references), "\x51k", "\x51t"},
                 offsets, references);
      const auto expected = size <= 8 ? std::optional(Dictionary{{"k", "t"}}) : std::nullopt;
      EXPECT_EQ(loadDictionary(folder.holding("list", bytes)), expected) << size;
    }
  }
}

TEST(Limits, EveryObjectOfABinaryListMustBeValidAndWhole) {
  const TemporaryFolder folder;
  const std::string whole = dictionaryOver(1, [](std::size_t) { return "\x51t"; });
  ASSERT_TRUE(loadDictionary(folder.holding("list", whole)));
  const std::pair<const char*, std::string> objects[] = {
      {"null", std::string("\x00", 1)},
      {"an unknown kind", "\x70"},
      {"an integer of 32 bytes", "\x15" + std::string(32, '\1')},
      {"a text past the objects", "\x5F\x12" + bigEndian(1000, 4) + "short"},
      {"a text of 2^64-1 units", "\x6F\x13" + std::string(8, '\xFF')},
      {"a text with a null character", std::string("\x62\0a\0\0", 5)},
      {"a size that is no integer", "\x5F\x51t"},
      {"data without its size", "\x4F"},
      {"an array past the objects", "\xA9"},
      {"a reference past the table", "\xA1" + bigEndian(3)},
      {"a dictionary with a number for a key", "\xD1" + bigEndian(2) + bigEndian(1)}};
  for (const auto& [name, object] : objects) {
    const std::string bytes = dictionaryOver(1, [&o = object](std::size_t) { return o; });
    EXPECT_FALSE(loadDictionary(folder.holding("list", bytes))) << name;
  }
  for (std::size_t size = 0; size < whole.size(); ++size)
    EXPECT_FALSE(loadDictionary(folder.holding("list", whole.substr(0, size)))) << size;
}

}  // namespace
}  // namespace onramp

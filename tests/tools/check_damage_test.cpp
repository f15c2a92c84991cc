#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <memory>
#include <random>
#include <string>
#include <vector>

#include "app/OnrampOSXAppDelegate.h"
#include "platform/property_list.h"
#include "tests/recording/front_end.h"
#include "tests/recording/temporary_folder.h"
#include "tools/check/check.h"

namespace onramp {
namespace {

namespace fs = std::filesystem;

/// A copy of the example medium, which a test damages in one random place at a time.
class DamagedMedium {
 public:
  DamagedMedium() {
    fs::copy(ONRAMP_MEDIUM, root_, fs::copy_options::recursive);
    const fs::path contents = root_ / "Onramp OSX.app/Contents";
    fs::create_directories(contents / "MacOS");
    write(contents / "MacOS/Onramp OSX", "program");
    fs::permissions(contents / "MacOS/Onramp OSX", fs::perms::owner_all);
    for (const auto& entry : fs::recursive_directory_iterator(root_ / "MacResources")) {
      if (entry.is_regular_file()) files_.push_back(entry.path());
    }
    files_.push_back(contents / "Info.plist");
    std::sort(files_.begin(), files_.end());
  }

  [[nodiscard]] std::string path() const { return root_.string(); }

  /// Damages one file and returns a description of the damage. `number` is the seed of all random
  /// choices. mend() restores the file.
  std::string damage(unsigned number) {
    random_.seed(number);
    const fs::path file = files_[below(files_.size())];
    damaged_ = file;
    whole_ = read(file);
    std::string what = file.filename().string() + ": ";
    if (const auto list = below(2) == 0 ? loadDictionary(file.string()) : std::nullopt) {
      EXPECT_TRUE(writeDictionaryAtomically(damagedCopy(*list, what), damaged_.string()));
      return what;
    }
    const std::size_t at = below(whole_.size());
    write(damaged_, whole_.substr(0, at));
    return what + "cut off at " + std::to_string(at);
  }

  void mend() const { write(damaged_, whole_); }

 private:
  std::size_t below(std::size_t count) { return count == 0 ? 0 : random_() % count; }

  static std::string read(const fs::path& file) {
    std::ifstream stream(file, std::ios::binary);
    return {std::istreambuf_iterator<char>(stream), {}};
  }
  static void write(const fs::path& file, const std::string& bytes) {
    std::ofstream(file, std::ios::binary) << bytes;
  }

  // Returns a copy of `dictionary` in which one random key, at any depth, is removed, renamed or
  // given a value of a different kind. A new name may equal the old one. Appends a description of
  // the change to `what`.
  Dictionary damagedCopy(const Dictionary& dictionary, std::string& what) {
    std::vector<Dictionary::Pair> pairs(dictionary.begin(), dictionary.end());
    if (pairs.empty()) return dictionary;
    Dictionary::Pair& pair = pairs[below(pairs.size())];
    const auto* const inner = pair.value.as<Dictionary>();
    what += "/" + pair.key;
    if (inner && !inner->empty() && below(4) != 0) {
      pair.value = damagedCopy(*inner, what);
      return Dictionary(std::move(pairs));
    }
    const std::size_t kind = below(3);
    what += kind == 0 ? " removed" : kind == 1 ? " renamed" : " of another kind";
    if (kind == 1) std::swap(pair.key[below(pair.key.size())], pair.key.back());
    if (kind == 2) pair.value = pair.value.as<std::string>() ? Value(Array()) : Value("NO");
    if (kind == 0) pairs.erase(pairs.begin() + (&pair - pairs.data()));
    return Dictionary(std::move(pairs));
  }

  TemporaryFolder folder_;
  fs::path root_ = fs::path(folder_ / "medium");
  std::vector<fs::path> files_;
  fs::path damaged_;
  std::string whole_;
  std::minstd_rand random_;
};

// Starts the wizard and returns the name of its first page, followed by " opens " and a path for
// each file that the wizard opens at once. Returns " refused" if the wizard shows an alert.
std::string startOfTheWizard() {
  recording::FrontEnd& screen = recording::FrontEnd::instance();
  screen.reset();
  const auto delegate = std::make_unique<OnrampOSXAppDelegate>();
  screen.launch(*delegate);
  if (!screen.alerts.empty()) return " refused";
  const auto& shown = screen.object("mainView").subviews;
  std::string start = shown.empty() ? "" : shown.front()->name;
  for (const std::string& opened : screen.opened)
    start += " opens " + opened;
  screen.reset();
  return start;
}

// Returns the name of the first page that `report` predicts, or an empty string for no page.
// `start`, the result of startOfTheWizard(), says whether the wizard refuses the system and so
// shows no page.
std::string pageIn(const check::Report& report, const std::string& start) {
  if (start == " refused" || report.start == FirstPage::kNone) return "";
  return report.start == FirstPage::kModelList ? "ModelListView" : "ConnectionTypeView";
}

// Damages the medium 100 times, or as often as the environment variable ONRAMP_DAMAGES says.
TEST(OnrampCheck, ReportsAllDamageThatChangesTheStart) {
  const char* const wanted = std::getenv("ONRAMP_DAMAGES");
  const unsigned long count = wanted ? std::strtoul(wanted, nullptr, 10) : 100;
  const TemporaryFolder support;
  setenv("XDG_DATA_HOME", (support / "user").c_str(), 1);
  setenv("XDG_DATA_DIRS", (support / "local").c_str(), 1);
  DamagedMedium medium;
  const check::Report whole = check::checkMedium(medium.path());
  ASSERT_TRUE(whole.findings.empty()) << whole.findings.front().found;
  const std::string wholeStart = startOfTheWizard();
  ASSERT_EQ(wholeStart, "ModelListView");
  unsigned others = 0;
  for (unsigned number = 1; number <= count; ++number) {
    SCOPED_TRACE(std::to_string(number) + ": " + medium.damage(number));
    const check::Report report = check::checkMedium(medium.path());
    const std::string start = startOfTheWizard();
    EXPECT_EQ(pageIn(report, start), start.substr(0, start.find(' '))) << start;
    if (start != wholeStart) ++others;
    EXPECT_TRUE(start == wholeStart || !report.findings.empty()) << start;
    medium.mend();
  }
  EXPECT_GT(others, count / 20);
}

}  // namespace
}  // namespace onramp

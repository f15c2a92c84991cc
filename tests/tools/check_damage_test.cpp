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

/// A copy of the example medium, which a test damages at random, in one place at a time.
class DamagedMedium {
 public:
  DamagedMedium() {
    fs::copy(SOURCE_FOLDER "/examples/medium", root_, fs::copy_options::recursive);
    const fs::path contents = root_ / "Onramp OSX.app/Contents";
    fs::create_directories(contents / "Resources");
    fs::create_directories(contents / "MacOS");
    fs::copy_file(INFORMATION, contents / "Info.plist");
    fs::copy(SOURCE_FOLDER "/resources", contents / "Resources", fs::copy_options::recursive);
    std::ofstream(contents / "MacOS/Onramp OSX") << "program";
    fs::permissions(contents / "MacOS/Onramp OSX", fs::perms::owner_all);
    for (const auto& entry : fs::recursive_directory_iterator(root_ / "MacResources")) {
      if (entry.is_regular_file()) files_.push_back(entry.path());
    }
    files_.push_back(contents / "Info.plist");
    std::sort(files_.begin(), files_.end());
  }

  [[nodiscard]] std::string path() const { return root_.string(); }

  /// Damages one file, with `number` as the seed of all random choices, and returns a description.
  /// mend() restores the file.
  std::string damage(unsigned number) {
    random_.seed(number);
    const fs::path file = files_[below(files_.size())];
    damaged_ = file;
    whole_ = read(file);
    const auto list = below(2) == 0 ? loadDictionary(file.string()) : std::nullopt;
    return file.filename().string() + ": " + (list ? damageList(*list) : damageBytes());
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

  std::string damageBytes() {
    std::string bytes = whole_;
    const std::size_t at = below(bytes.size());
    const std::size_t count = 1 + below(20);
    const std::size_t kind = below(5);
    if (kind == 0) bytes[at] = static_cast<char>(below(256));
    if (kind == 1) bytes.resize(at);
    if (kind == 2) bytes.erase(at, count);
    if (kind == 3) bytes.insert(at, bytes.substr(below(bytes.size()), count));
    if (kind == 4) {
      fs::remove(damaged_);
      return "removed";
    }
    write(damaged_, bytes);
    const char* const kinds[] = {"a byte changed", "cut off", "bytes removed", "bytes repeated"};
    return std::string(kinds[kind]) + " at " + std::to_string(at);
  }

  std::string damageList(const Dictionary& list) {
    std::string what;
    const Dictionary damaged = damagedCopy(list, what);
    EXPECT_TRUE(writeDictionaryAtomically(damaged, damaged_.string()));
    return what;
  }

  // Returns a copy in which one random key below `dictionary` is removed, renamed or given another
  // kind of value. Appends a description to `what`.
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

// Returns what the wizard shows and opens before it waits for the user.
std::string startOfTheWizard() {
  recording::FrontEnd& screen = recording::FrontEnd::instance();
  screen.reset();
  const auto delegate = std::make_unique<OnrampOSXAppDelegate>();
  screen.launch(*delegate);
  if (!screen.alerts.empty()) return "refused";
  const auto& shown = screen.object("mainView").subviews;
  std::string start = shown.empty() ? "" : shown.front()->name;
  for (const std::string& opened : screen.opened)
    start += " opens " + opened;
  screen.reset();
  return start;
}

// Returns the start that `report` predicts, in the words of startOfTheWizard(). Returns `start`
// itself, so that the comparison passes, in two cases: the wizard refused the system, or the report
// predicts no page and the wizard does not show the model list.
std::string startIn(const check::Report& report, const std::string& start) {
  if (start == "refused") return start;
  if (report.start == FirstPage::kNone) return start.starts_with("ModelListView") ? "" : start;
  return report.start == FirstPage::kModelList ? "ModelListView" : "ConnectionTypeView";
}

// For a longer run, set ONRAMP_DAMAGES to the number of times the medium is damaged.
TEST(OnrampCheck, ReportsEveryDamageThatChangesTheStart) {
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
    EXPECT_EQ(startIn(report, start), start);
    if (start != wholeStart) ++others;
    EXPECT_TRUE(start == wholeStart || !report.findings.empty()) << start;
    medium.mend();
  }
  EXPECT_GT(others, count / 20);
  RecordProperty("others", static_cast<int>(others));
}

}  // namespace
}  // namespace onramp

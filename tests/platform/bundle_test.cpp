#include "platform/bundle.h"

#include <gtest/gtest.h>

#include "platform/freedesktop/language.h"
#include "tests/recording/medium_folder.h"

namespace onramp {
namespace {

using Names = std::vector<std::string>;

TEST(Language, FallsBackToTheDevelopmentLanguageThenEnglishThenAny) {
  const std::tuple<Names, Names, std::string, Names> cases[] = {
      {{"de", "en"}, {"de_AT"}, "en", {"de", "en"}},
      {{"EN_us", "en", "yue-Hant"}, {"zh-Hant-HK", "en_US"}, "fr", {"EN_us", "en"}},
      {{"de", "de_AT", "en"}, {"de_AT@euro"}, "en", {"de_AT", "de", "en"}},
      {{"de_AT", "de_CH", "de"}, {"de"}, "en", {"de", "de_AT", "de_CH"}},
      {{"English", "German"}, {"de_DE"}, "English", {"German", "English"}},
      {{"en", "fr"}, {"ko", "fr_CA"}, "en", {"fr", "en"}},
      {{"en", "no"}, {"nb_NO"}, "en", {"no", "en"}},
      {{"en", "zh_CN", "zh_TW"}, {"zh_CN"}, "en", {"zh_CN", "en"}},
      {{"en", "zh-Hans", "zh-Hant"}, {"zh_TW"}, "en", {"zh-Hant", "en"}},
      {{"en", "zh-Hans"}, {"zh_TW"}, "en", {"en"}},
      {{"en", "zh_TW"}, {"zh_HK"}, "en", {"zh_TW", "en"}},
      {{"en", "zh_CN"}, {"zh-Hans-SG"}, "en", {"zh_CN", "en"}},
      {{"en", "zh"}, {"zh-Hans-CN"}, "en", {"zh", "en"}},
      {{"sr", "sr-Latn"}, {"sr_RS"}, "en", {"sr", "sr-Latn"}},
      {{"ja"}, {"fr"}, "en", {"ja"}},
      {{"de", "en_GB"}, {"fr"}, "it", {"en_GB"}},
      {{"Base", "zh", "ko", "ja"}, {"zh_TW"}, "it", {"ja"}},
      {{"en", "zh_CN", "zh_TW"}, {"zh_MO"}, "en", {"zh_TW", "en"}},
      {{"Base"}, {"fr"}, "en", {}},
      {{"en", "ja"}, {"fr"}, "ja_JP", {"ja"}},
      {{}, {"en"}, "en", {}}};
  for (const auto& [offered, preferred, development, expected] : cases) {
    EXPECT_EQ(languagesToSearch(offered, preferred, development), expected)
        << testing::PrintToString(offered) << " for " << testing::PrintToString(preferred);
  }
}

class BundleOnMedium : public testing::Test {
 protected:
  void resource(const std::string& name, const std::string& bytes) const {
    medium.write("Some.bundle/Contents/Resources/" + name, bytes);
  }

  [[nodiscard]] std::string text(const std::string& key) const {
    const auto bundle = Bundle::open(medium.path("Some.bundle"));
    return bundle ? bundle->localizedString(key, "fallback", std::nullopt) : "no bundle";
  }

  recording::MediumFolder medium;
};

TEST_F(BundleOnMedium, UsesTheUsersLanguageAndReadsTheFilesEachTime) {
  resource("English.lproj/Localizable.strings", "k = english; only = english;");
  resource("zh_CN.lproj/Localizable.strings", "\"k\" = \"简体\";");
  medium.setEnvironment("LANG", "zh_CN.UTF-8");
  EXPECT_EQ(text("k"), "简体");
  EXPECT_EQ(text("only"), "fallback") << "only one language's table is read";
  medium.setEnvironment("LANG", "ko_KR.UTF-8");
  EXPECT_EQ(text("k"), "english");
  medium.setEnvironment("LANGUAGE", "pt:zh_CN");
  EXPECT_EQ(text("k"), "简体");
  medium.setEnvironment("LC_ALL", "C");
  EXPECT_EQ(text("k"), "english") << "the C locale ignores LANGUAGE";

  medium.setEnvironment("LC_ALL", "ko_KR.UTF-8");
  medium.setEnvironment("LANGUAGE", std::nullopt);
  medium.write("Some.bundle/Contents/Info.plist",
               Dictionary{{"CFBundleDevelopmentRegion", "zh_CN"}});
  EXPECT_EQ(text("k"), "简体");
  resource("ko.lproj/Localizable.strings", "k = ");
  EXPECT_EQ(text("k"), "fallback") << "a table that cannot be read is empty";
  resource("ko.lproj/Localizable.strings", "k = korean;");
  EXPECT_EQ(text("k"), "korean");
}

}  // namespace
}  // namespace onramp

#include "base/value.h"

#include <gtest/gtest.h>

#include <limits>

namespace onramp {
namespace {

constexpr std::int64_t kMin = std::numeric_limits<std::int64_t>::min();
constexpr std::int64_t kMax = std::numeric_limits<std::int64_t>::max();
constexpr double kInfinity = std::numeric_limits<double>::infinity();
constexpr double kTwoTo63 = 9223372036854775808.0;

TEST(Value, ReadsAsAnIntegerWithinTheSignedRange) {
  const std::pair<Value, std::int64_t> cases[] = {{true, 1},
                                                  {-5, -5},
                                                  {std::uint64_t{1} << 63, kMax},
                                                  {2.9, 2},
                                                  {-2.9, -2},
                                                  {std::numeric_limits<double>::quiet_NaN(), 0},
                                                  {kInfinity, kMax},
                                                  {-kInfinity, kMin},
                                                  {kTwoTo63, kMax},
                                                  {-kTwoTo63, kMin},
                                                  {"12 pages", 12},
                                                  {" \t\n+7x", 7},
                                                  {"-0013", -13},
                                                  {"", 0},
                                                  {" ", 0},
                                                  {"-", 0},
                                                  {"+-3", 0},
                                                  {"- 3", 0},
                                                  {"x9", 0},
                                                  {"9223372036854775807", kMax},
                                                  {"9223372036854775808", kMax},
                                                  {"-9223372036854775808", kMin},
                                                  {"-9223372036854775809", kMin},
                                                  {"99999999999999999999999", kMax},
                                                  {Date{5}, 0},
                                                  {Array{1}, 0},
                                                  {Dictionary{{"k", 1}}, 0}};
  for (const auto& [value, expected] : cases)
    EXPECT_EQ(value.integerValue(), expected) << "case " << &value - &cases[0].first;
}

TEST(Value, IsTrueWhenItIsANumberOtherThanZero) {
  const std::pair<Value, std::optional<bool>> cases[] = {{false, false},
                                                         {0, false},
                                                         {0.0, false},
                                                         {true, true},
                                                         {-1, true},
                                                         {0.5, true},
                                                         {std::uint64_t{1} << 63, true},
                                                         {"1", std::nullopt},
                                                         {Array{true}, std::nullopt}};
  for (const auto& [value, expected] : cases)
    EXPECT_EQ(value.boolean(), expected);
}

TEST(Value, IsSignedWhereverItFits) {
  EXPECT_EQ(Value(std::uint64_t{5}), Value(5));
  EXPECT_EQ(Value(std::uint64_t{1} << 63).as<std::int64_t>(), nullptr);
  EXPECT_FALSE(Value(1) == Value(true));
  EXPECT_FALSE(Value(1) == Value(1.0));
}

TEST(Dictionary, KeepsTheFirstOfEqualKeysInTheOrderOfTheKeys) {
  const Dictionary pairs{{"b", 1}, {"a", 2}, {"b", 3}, {"B", 4}};
  std::string keys;
  for (const auto& [key, value] : pairs)
    keys += key;
  EXPECT_EQ(keys, "Bab");
  EXPECT_EQ(pairs.integerValue("b"), 1);
  std::vector<Dictionary::Pair> many;
  for (int i = 1; i <= 100; ++i)
    many.emplace_back(i % 2 == 0 ? "even" : "odd", i);
  EXPECT_EQ(Dictionary(many), (Dictionary{{"even", 2}, {"odd", 1}}));
  EXPECT_EQ(pairs.find("c"), nullptr);
  EXPECT_EQ(Dictionary().find(""), nullptr);
}

TEST(Dictionary, GivesAValueOfTheRightKindOnly) {
  const Dictionary inner{{"k", "v"}};
  const Dictionary record{{"text", "5"}, {"flag", true}, {"inner", inner}, {"list", Array{1}}};
  EXPECT_EQ(record.string("text"), "5");
  EXPECT_EQ(record.boolean("flag"), true);
  EXPECT_EQ(record.dictionary("inner"), inner);
  EXPECT_EQ(*record.array("list"), Array{1});
  EXPECT_EQ(record.integerValue("text"), 5);
  for (const char* const other : {"inner", "list", "absent"}) {
    EXPECT_EQ(record.string(other), std::nullopt);
    EXPECT_EQ(record.boolean(other), std::nullopt);
    EXPECT_EQ(record.integerValue(other), 0);
  }
  EXPECT_EQ(record.dictionary("text"), std::nullopt);
  EXPECT_EQ(record.array("text"), nullptr);
}

TEST(Dictionary, WithReplacesAndAddsInACopy) {
  const Dictionary before{{"k", 1}};
  EXPECT_EQ(before.with("k", 2), (Dictionary{{"k", 2}}));
  EXPECT_EQ(before.with("j", 2), (Dictionary{{"j", 2}, {"k", 1}}));
  EXPECT_EQ(Dictionary().with("k", 1), before);
  EXPECT_EQ(before.integerValue("k"), 1);
}

}  // namespace
}  // namespace onramp

#include "base/value.h"

#include <gtest/gtest.h>

#include <cmath>

namespace onramp {
namespace {

constexpr double kTwoTo63 = 9223372036854775808.0;

TEST(Value, ConvertsToAnIntegerAndClampsItToTheSignedRange) {
  const std::pair<std::int64_t, Array> cases[] = {
      {1, {true, "1x"}},
      {-5, {-5}},
      {2, {2.9}},
      {-2, {-2.9}},
      {12, {"12 pages", " \t\n+12", "0012"}},
      {-13, {"-0013"}},
      {0,
       {std::nan(""), "", " ", "-", "+-3", "- 3", "x9", Date{5}, Array{1}, Dictionary{{"k", 1}}}},
      {INT64_MAX, {std::uint64_t{1} << 63, HUGE_VAL, kTwoTo63, "9223372036854775808"}},
      {INT64_MAX, {"9223372036854775807", "99999999999999999999999"}},
      {INT64_MIN, {-HUGE_VAL, -kTwoTo63, "-9223372036854775808", "-9223372036854775809"}}};
  for (const auto& [expected, values] : cases) {
    for (const Value& value : values)
      EXPECT_EQ(value.integerValue(), expected) << &value - values.data();
  }
}

TEST(Value, IsTrueWhenItIsANumberOtherThanZero) {
  const std::pair<std::optional<bool>, Array> cases[] = {
      {false, {false, 0, 0.0}},
      {true, {true, -1, 0.5, std::uint64_t{1} << 63}},
      {std::nullopt, {"1", Array{true}}}};
  for (const auto& [expected, values] : cases) {
    for (const Value& value : values)
      EXPECT_EQ(value.boolean(), expected) << &value - values.data();
  }
}

TEST(Value, StoresAnIntegerAsSignedIfItFits) {
  EXPECT_EQ(Value(std::uint64_t{5}), Value(5));
  EXPECT_EQ(Value(std::uint64_t{1} << 63).as<std::int64_t>(), nullptr);
  EXPECT_FALSE(Value(1) == Value(true));
  EXPECT_FALSE(Value(1) == Value(1.0));
}

TEST(Dictionary, KeepsTheFirstOfEqualKeysAndSortsTheKeys) {
  std::vector<Dictionary::Pair> many;
  for (int i = 1; i <= 100; ++i)
    many.emplace_back(std::string(1, "bBa"[i % 3]), i);
  const Dictionary dictionary(many);
  EXPECT_EQ(dictionary, (Dictionary{{"B", 1}, {"a", 2}, {"b", 3}}));
  std::string keys;
  for (const auto& [key, value] : dictionary)
    keys += key;
  EXPECT_EQ(keys, "Bab");
  EXPECT_EQ(dictionary.with("a", 7), (Dictionary{{"B", 1}, {"a", 7}, {"b", 3}}));
  EXPECT_EQ(Dictionary().with("k", 1), (Dictionary{{"k", 1}}));
}

TEST(Dictionary, ReturnsOnlyValuesOfTheRequestedType) {
  const Dictionary inner{{"k", "v"}};
  const Dictionary record{{"text", "5"}, {"flag", true}, {"inner", inner}, {"list", Array{1}}};
  EXPECT_EQ(record.string("text"), "5");
  EXPECT_EQ(record.boolean("flag"), true);
  EXPECT_EQ(record.dictionary("inner"), inner);
  EXPECT_EQ(*record.array("list"), Array{1});
  for (const char* const other : {"inner", "list", "absent"})
    EXPECT_FALSE(record.string(other) || record.boolean(other) || record.integerValue(other));
  EXPECT_FALSE(record.dictionary("text") || record.array("text"));
}

}  // namespace
}  // namespace onramp

// SPDX-License-Identifier: Apache-2.0
#include "ZlvLevel.h"

#include <gtest/gtest.h>

#include <ostream>

namespace zelvo_test {
namespace {

struct LevelRow {
    const char *label;
    const char *text;
    ZlvLevel level;
};

void PrintTo(const LevelRow &row, std::ostream *out)
{
    *out << (row.text ? row.text : "null");
}

class ZlvLevelText : public testing::TestWithParam<LevelRow> {};

TEST_P(ZlvLevelText, GivesTheLevel)
{
    EXPECT_EQ(ZlvGetLevelFromString(GetParam().text), GetParam().level);
}

std::string labelOf(const testing::TestParamInfo<LevelRow> &info)
{
    return info.param.label;
}

constexpr LevelRow names[] = {
    {"Fatal", "FATAL", 7000},
    {"Error", "ERROR", 6000},
    {"Warn", "WARN", 5000},
    {"Info", "INFO", 4000},
    {"DebugMin", "DEBUG_MIN", 3000},
    {"Min", "MIN", 3000},
    {"DebugMid", "DEBUG_MID", 2000},
    {"Mid", "MID", 2000},
    {"DebugMax", "DEBUG_MAX", 1000},
    {"Max", "MAX", 1000},
    {"All", "ALL", 0},
    {"Off", "OFF", 9999},
};
INSTANTIATE_TEST_SUITE_P(Name, ZlvLevelText, testing::ValuesIn(names), labelOf);

constexpr LevelRow anyCase[] = {
    {"Fatal", "fatal", 7000},
    {"Error", "eRRoR", 6000},
    {"Warn", "Warn", 5000},
    {"Info", "info", 4000},
    {"DebugMin", "debug_min", 3000},
    {"Min", "Min", 3000},
    {"DebugMid", "Debug_Mid", 2000},
    {"Mid", "mid", 2000},
    {"DebugMax", "dEBUG_mAX", 1000},
    {"Max", "max", 1000},
    {"All", "all", 0},
    {"Off", "off", 9999},
};
INSTANTIATE_TEST_SUITE_P(AnyCase, ZlvLevelText, testing::ValuesIn(anyCase), labelOf);

constexpr LevelRow longerWords[] = {
    {"Fatal", "fatally", 7000},    {"Error", "Errors", 6000},
    {"Warn", "Warning", 5000},     {"WarnLower", "warning", 5000},
    {"Info", "Information", 4000}, {"DebugMin", "DEBUG_MINIMUM", 3000},
    {"Min", "minutes", 3000},      {"DebugMid", "DEBUG_MIDDLE", 2000},
    {"Mid", "midday", 2000},       {"DebugMax", "DEBUG_MAX ", 1000},
    {"Max", "maximum", 1000},      {"All", "allow", 0},
    {"Off", "offline", 9999},      {"InfoAndMore", "INFO,WARN", 4000},
};
INSTANTIATE_TEST_SUITE_P(LongerWord, ZlvLevelText, testing::ValuesIn(longerWords), labelOf);

constexpr LevelRow numbers[] = {
    {"Plain", "42", 42},
    {"Negative", "-5", -5},
    {"Signed", "+7", 7},
    {"None", "-9999", -9999},
    {"Zero", "0", 0},
    {"AfterBlanks", " \t 4000", 4000},
    {"BeforeLetters", "12abc", 12},
    {"BeforeAName", "3 INFO", 3},
    {"BeforeADot", "10.9", 10},
    {"NoHexadecimal", "0x10", 0},
    {"NoOctal", "010", 10},
    {"Largest", "2147483647", 2147483647},
    {"Smallest", "-2147483648", -2147483647 - 1},
};
INSTANTIATE_TEST_SUITE_P(Number, ZlvLevelText, testing::ValuesIn(numbers), labelOf);

constexpr LevelRow nothingRead[] = {{"Empty", "", 0}, {"Blanks", " \t\n", 0}};
INSTANTIATE_TEST_SUITE_P(NothingToRead, ZlvLevelText, testing::ValuesIn(nothingRead), labelOf);

constexpr LevelRow noLevel[] = {
    {"Null", nullptr, -9999},
    {"DebugAlone", "DEBUG", -9999},
    {"None", "none", -9999},
    {"CutName", "FATA", -9999},
    {"CutDebugName", "DEBUG_M", -9999},
    {"BlankFirst", " INFO", -9999},
    {"OtherWord", "trace", -9999},
    {"NameInside", "noinfo", -9999},
    {"Underscore", "_", -9999},
    {"TwoLetters", "mi", -9999},
};
INSTANTIATE_TEST_SUITE_P(NoLevel, ZlvLevelText, testing::ValuesIn(noLevel), labelOf);

TEST(ZlvLevel, ConstantsHaveTheirValues)
{
    EXPECT_EQ(ZLV_LEVEL_FATAL, 7000);
    EXPECT_EQ(ZLV_LEVEL_ERROR, 6000);
    EXPECT_EQ(ZLV_LEVEL_WARN, 5000);
    EXPECT_EQ(ZLV_LEVEL_INFO, 4000);
    EXPECT_EQ(ZLV_LEVEL_DEBUG_MIN, 3000);
    EXPECT_EQ(ZLV_LEVEL_DEBUG_MID, 2000);
    EXPECT_EQ(ZLV_LEVEL_DEBUG_MAX, 1000);
    EXPECT_EQ(ZLV_LEVEL_ALL, 0);
    EXPECT_EQ(ZLV_LEVEL_OFF, 9999);
    EXPECT_EQ(ZLV_LEVEL_NONE, -9999);
}

} // namespace
} // namespace zelvo_test

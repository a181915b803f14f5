// SPDX-License-Identifier: Apache-2.0
// The reader's table of states: what each of the fourteen states does with each of the 256 bytes.
#include "ZlvReadPropsIntl.h"

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "support/Buffers.h"
#include "support/FailAlloc.h"

namespace zelvo_test {
namespace {

constexpr int32_t Failed = 16;

using Handler = int32_t (*)(char, ZlvReadPropsContext *);

/// The handler of each state, by the state's number.
constexpr Handler handlers[] = {nullptr,
                                zlvRdprDoStartLineState,
                                zlvRdprDoStartLineBlanksState,
                                zlvRdprDoCommentLineState,
                                zlvRdprDoKeyCharsState,
                                zlvRdprDoKeyCharEscapeState,
                                zlvRdprDoKeyEndBlanksFirstState,
                                zlvRdprDoKeyEndBlanksFinalState,
                                zlvRdprDoValCharsState,
                                zlvRdprDoValEscapeState,
                                zlvRdprDoMultiLineValState,
                                zlvRdprDoUU0State,
                                zlvRdprDoUU1State,
                                zlvRdprDoUU2State,
                                zlvRdprDoUU3State};

enum class Does {
    Nothing,      // goes on
    Key,          // appends the character to the key
    Value,        // appends it to the value
    Emit,         // emits key and value
    Add,          // adds the digit times the row's weight to the sum
    AddAndAppend, // adds the digit, then appends the sum to the value as a code point
};

const std::string Blanks = " \t\v\f";
const std::string LineEnds = "\n\r";
const std::string Digits = "0123456789abcdefABCDEF";

struct Row {
    const char *label;
    int32_t state;
    std::string characters; // "" stands for all that the state's other rows leave
    Does does;
    int32_t next;
    int32_t weight = 0;
};

const Row rows[] = {
    {"StartOfLineBlank", 1, Blanks, Does::Nothing, 2},
    {"StartOfLineCommentSign", 1, "!#", Does::Nothing, 3},
    {"StartOfLineLineEnd", 1, LineEnds, Does::Nothing, 1},
    {"StartOfLineOther", 1, "", Does::Key, 4},
    {"StartBlanksBlank", 2, Blanks, Does::Nothing, 2},
    {"StartBlanksCommentSign", 2, "!#", Does::Nothing, 3},
    {"StartBlanksLineEnd", 2, LineEnds, Does::Nothing, 1},
    {"StartBlanksSeparator", 2, "=:", Does::Nothing, Failed},
    {"StartBlanksOther", 2, "", Does::Key, 4},
    {"CommentLineEnd", 3, LineEnds, Does::Nothing, 1},
    {"CommentOther", 3, "", Does::Nothing, 3},
    {"KeyBackslash", 4, "\\", Does::Nothing, 5},
    {"KeyBlank", 4, Blanks, Does::Nothing, 6},
    {"KeySeparator", 4, ":=", Does::Nothing, 7},
    {"KeyLineEnd", 4, LineEnds, Does::Nothing, Failed},
    {"KeyOther", 4, "", Does::Key, 4},
    {"KeyEscapeSpecial", 5, "\\ \t\v\f=:", Does::Key, 4},
    {"KeyEscapeOther", 5, "", Does::Nothing, Failed},
    {"AfterKeyBlank", 6, Blanks, Does::Nothing, 6},
    {"AfterKeySeparator", 6, ":=", Does::Nothing, 7},
    {"AfterKeyBackslash", 6, "\\", Does::Nothing, 9},
    {"AfterKeyLineEnd", 6, LineEnds, Does::Nothing, Failed},
    {"AfterKeyOther", 6, "", Does::Value, 8},
    {"AfterSeparatorBlank", 7, Blanks, Does::Nothing, 7},
    {"AfterSeparatorLineEnd", 7, LineEnds, Does::Emit, 1},
    {"AfterSeparatorBackslash", 7, "\\", Does::Nothing, 9},
    {"AfterSeparatorOther", 7, "", Does::Value, 8},
    {"ValueBackslash", 8, "\\", Does::Nothing, 9},
    {"ValueLineEnd", 8, LineEnds, Does::Emit, 1},
    {"ValueOther", 8, "", Does::Value, 8},
    {"ValueEscapeSpecial", 9, " \t\v\f\"'\\", Does::Value, 8},
    {"ValueEscapeLineEnd", 9, LineEnds, Does::Nothing, 10},
    {"ValueEscapeU", 9, "uU", Does::Nothing, 11},
    {"ValueEscapeOther", 9, "", Does::Nothing, Failed},
    {"ContinuationBackslash", 10, "\\", Does::Nothing, 9},
    {"ContinuationBlank", 10, Blanks, Does::Nothing, 10},
    {"ContinuationLineEnd", 10, LineEnds, Does::Emit, 1},
    {"ContinuationOther", 10, "", Does::Value, 8},
    {"FirstHexDigit", 11, Digits, Does::Add, 12, 4096},
    {"FirstNoHexDigit", 11, "", Does::Nothing, Failed},
    {"SecondHexDigit", 12, Digits, Does::Add, 13, 256},
    {"SecondNoHexDigit", 12, "", Does::Nothing, Failed},
    {"ThirdHexDigit", 13, Digits, Does::Add, 14, 16},
    {"ThirdNoHexDigit", 13, "", Does::Nothing, Failed},
    {"FourthHexDigit", 14, Digits, Does::AddAndAppend, 8, 1},
    {"FourthNoHexDigit", 14, "", Does::Nothing, Failed},
};

/// The characters that ROW stands for.
std::vector<char> charactersOf(const Row &row)
{
    std::vector<char> mine(row.characters.begin(), row.characters.end());
    if (!mine.empty())
        return mine;
    std::string taken;
    for (const Row &other : rows)
        if (other.state == row.state)
            taken += other.characters;
    for (int code = 0; code < 256; ++code)
        if (taken.find(static_cast<char>(code)) == std::string::npos)
            mine.push_back(static_cast<char>(code));
    return mine;
}

/// Letters count from 0, whichever their case.
int32_t digitValue(char c)
{
    if (c >= '0' && c <= '9')
        return c - '0';
    return c >= 'a' ? c - 'a' : c - 'A';
}

/// A context that a test fills, and the list it emits into.
struct Context : ZlvReadPropsContext {
    Context() : ZlvReadPropsContext{} { target = &list; }
    Context(const Context &) = delete;
    Context &operator=(const Context &) = delete;
    ~Context()
    {
        CxStringBuffDiscard(&key);
        CxStringBuffDiscard(&value);
    }

    void fill(const std::string &keyText, const std::string &valueText, int32_t sum)
    {
        CxStringBuffAppendStr(&key, keyText.c_str());
        CxStringBuffAppendStr(&value, valueText.c_str());
        codePoint = sum;
    }

    static std::string bytes(const CxStringBuff &buff)
    {
        return buff.data == nullptr ? "" : std::string(buff.data, buff.length);
    }

    Props list;
};

/// Feeds C to ROW's state in a context of key "k", value "v" and sum 0x1230, and checks all of it.
void checkOne(const Row &row, char c)
{
    Context context;
    context.fill("k", "v", 0x1230);
    // The first state empties both buffers before anything else.
    std::string key = row.state == 1 ? "" : "k", value = row.state == 1 ? "" : "v";
    int32_t sum = 0x1230 + (row.weight == 0 ? 0 : digitValue(c) * row.weight);
    if (row.does == Does::Key)
        key += c;
    if (row.does == Does::Value)
        value += c;
    if (row.does == Does::AddAndAppend) // 0x1230 to 0x1239
        value += std::string("\xE1\x88") + static_cast<char>(0x80 + (sum & 0x3F));

    EXPECT_EQ(handlers[row.state](c, &context), row.next);
    EXPECT_EQ(Context::bytes(context.key), key);
    EXPECT_EQ(Context::bytes(context.value), value);
    EXPECT_EQ(context.codePoint, sum);
    EXPECT_EQ(context.list.all(), row.does == Does::Emit ? "k=v" : "");
}

class ZlvReadPropsRow : public testing::TestWithParam<Row> {};

TEST_P(ZlvReadPropsRow, HoldsForEachOfItsCharacters)
{
    for (char c : charactersOf(GetParam())) {
        SCOPED_TRACE(static_cast<int>(static_cast<unsigned char>(c)));
        checkOne(GetParam(), c);
    }
}

TEST_P(ZlvReadPropsRow, AppendingWithoutMemoryIsAnError)
{
    Does does = GetParam().does;
    if (does != Does::Key && does != Does::Value && does != Does::AddAndAppend)
        return checkOne(GetParam(), charactersOf(GetParam()).front());
    for (char c : charactersOf(GetParam())) {
        Context context;
        FailAlloc fail(0);
        EXPECT_EQ(handlers[GetParam().state](c, &context), Failed);
        EXPECT_GT(fail.failed(), 0U);
    }
}

INSTANTIATE_TEST_SUITE_P(Table, ZlvReadPropsRow, testing::ValuesIn(rows),
                         [](const auto &row) { return row.param.label; });

// The rows leave no byte of any state out, and name none twice.
class ZlvReadPropsState : public testing::TestWithParam<int32_t> {};

TEST_P(ZlvReadPropsState, KnowsEveryByteOnce)
{
    std::vector<int> seen(256);
    for (const Row &row : rows)
        if (row.state == GetParam())
            for (char c : charactersOf(row))
                ++seen[static_cast<unsigned char>(c)];
    EXPECT_EQ(seen, std::vector<int>(256, 1));
}

TEST_P(ZlvReadPropsState, WithoutAContextIsAnError)
{
    for (int code = 0; code < 256; ++code)
        EXPECT_EQ(handlers[GetParam()](static_cast<char>(code), nullptr), Failed) << code;
}

// With buffers that never held anything the next state is the same, but for emits, which have no
// value text and fail.
TEST_P(ZlvReadPropsState, AnswersTheSameForFreshBuffersExceptForEmits)
{
    for (const Row &row : rows) {
        if (row.state != GetParam())
            continue;
        for (char c : charactersOf(row)) {
            Context context;
            int32_t next = row.does == Does::Emit ? Failed : row.next;
            EXPECT_EQ(handlers[row.state](c, &context), next) << row.label << " " << int(c);
            EXPECT_EQ(context.list.count, 0);
        }
    }
}

INSTANTIATE_TEST_SUITE_P(AllFourteen, ZlvReadPropsState, testing::Range(1, 15));

TEST(ZlvReadPropsStates, EmitsKeepKeyAndValueForTheEndOfInput)
{
    for (int32_t state : {7, 8, 10}) {
        Context context;
        context.fill("k", "v", 0);
        EXPECT_EQ(handlers[state]('\n', &context), 1);
        EXPECT_EQ(Context::bytes(context.key), "k");
        EXPECT_EQ(Context::bytes(context.value), "v");
    }
}

TEST(ZlvReadPropsStates, AnEmitWithoutAContextTakesNothing)
{
    EXPECT_EQ(zlvRdprEmitCfg(nullptr), 0);
}

TEST(ZlvReadPropsStates, AnEmitWithoutMemoryIsAnError)
{
    for (int32_t state : {7, 8, 10}) {
        Context context;
        context.fill("k", "v", 0);
        FailAlloc fail(0);
        EXPECT_EQ(handlers[state]('\n', &context), Failed);
    }
}

TEST(ZlvReadPropsStates, TheSumWrapsLikeAnUnsignedNumber)
{
    Context context;
    context.codePoint = INT32_MAX;
    EXPECT_EQ(zlvRdprDoUU0State('1', &context), 12);
    EXPECT_EQ(context.codePoint, INT32_MIN + 4095);
    context.codePoint = -1;
    EXPECT_EQ(zlvRdprDoUU3State('1', &context), 8);
    EXPECT_EQ(context.codePoint, 0);
}

TEST(ZlvReadPropsStates, TheStatesHaveTheirNumbers)
{
    EXPECT_EQ(ZLV_RDPR_START_LINE, 1);
    EXPECT_EQ(ZLV_RDPR_DONE, 15);
    EXPECT_EQ(ZLV_RDPR_ERROR, 16);
}

} // namespace
} // namespace zelvo_test

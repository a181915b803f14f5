// SPDX-License-Identifier: Apache-2.0
// Dates within one second, against the same format asked each time.
#include "ZlvSecondText.h"

#include <initializer_list>
#include <string>

#include "support/IcuDefaults.h"

namespace zelvo_test {
namespace {

constexpr double SECOND = 1155718135000.0; // 2006-08-16 08:48:55 UTC

class ZlvSecondText : public ::testing::Test {
protected:
    void TearDown() override { format_.close(); }

    void open(const char *pattern) { ASSERT_TRUE(format_.open(pattern)); }

    std::u16string reused(double time)
    {
        CxUStringBuff out = {};
        second_.append(&out, format_, time);
        return take(&out);
    }

    std::u16string asked(double time)
    {
        CxUStringBuff out = {};
        format_.append(&out, time);
        return take(&out);
    }

    void expectSame(std::initializer_list<double> times)
    {
        for (const double time : times)
            EXPECT_EQ(reused(time), asked(time)) << time;
    }

    void expectSameForEachMillisecond(const char *pattern)
    {
        open(pattern);
        for (int millisecond = 0; millisecond < 1000; ++millisecond)
            expectSame({SECOND + millisecond});
    }

private:
    static std::u16string take(CxUStringBuff *out)
    {
        const std::u16string text{out->data, out->length};
        CxUStringBuffDiscard(out);
        return text;
    }

    zelvo::DateFormat format_;
    zelvo::SecondText second_;
};

TEST_F(ZlvSecondText, OfTheDefaultFormIsThatOfTheFormat)
{
    expectSameForEachMillisecond(nullptr);
}

TEST_F(ZlvSecondText, WithoutMillisecondsIsThatOfTheFormat)
{
    expectSameForEachMillisecond("HH:mm:ss");
}

TEST_F(ZlvSecondText, WithMillisecondsInTheMiddleIsThatOfTheFormat)
{
    expectSameForEachMillisecond("yyyy SSS 'o''clock' mm");
}

TEST_F(ZlvSecondText, WithMillisecondsOfTheDayIsThatOfTheFormat)
{
    expectSameForEachMillisecond("A");
}

TEST_F(ZlvSecondText, WithTenthsIsThatOfTheFormat)
{
    expectSameForEachMillisecond("ss.S");
}

TEST_F(ZlvSecondText, WithMicrosecondsIsThatOfTheFormat)
{
    expectSameForEachMillisecond("ss.SSSSSS");
}

TEST_F(ZlvSecondText, WithMillisecondsTwiceIsThatOfTheFormat)
{
    expectSameForEachMillisecond("SSS ss SSS");
}

TEST_F(ZlvSecondText, WithMillisecondsNextToTenthsIsThatOfTheFormat)
{
    expectSameForEachMillisecond("'S'SSSA");
}

TEST_F(ZlvSecondText, LongerThanItsAreaIsThatOfTheFormat)
{
    expectSameForEachMillisecond(("SSS'" + std::string(200, 'x') + "'").c_str());
}

TEST_F(ZlvSecondText, InDigitsOfAnotherScriptIsThatOfTheFormat)
{
    const DefaultLocale arabic("ar_EG");
    expectSameForEachMillisecond(nullptr);
}

TEST_F(ZlvSecondText, InAnotherCalendarIsThatOfTheFormat)
{
    const DefaultLocale thai("th_TH");
    expectSameForEachMillisecond(nullptr);
}

TEST_F(ZlvSecondText, FollowsTheTimeFromSecondToSecondAndBack)
{
    open(nullptr);
    expectSame({SECOND, SECOND + 1, SECOND + 999, SECOND + 1000, SECOND + 1001, SECOND + 1, SECOND,
                SECOND - 1, SECOND - 2});
}

TEST_F(ZlvSecondText, OfTimesOutOfTheOrdinaryIsThatOfTheFormat)
{
    open(nullptr);
    expectSame({-1, -1, -999, -1000, 0, 0, -0.0, 0.5, 0.5, 0.25, SECOND + 0.5, SECOND + 0.5,
                253402300799999.0, 253402300800000.0, 253402300800001.0, 1e300, -1e300, 1e300});
}

} // namespace
} // namespace zelvo_test

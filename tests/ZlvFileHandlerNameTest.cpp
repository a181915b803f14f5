// SPDX-License-Identifier: Apache-2.0
// The property that names the log file.
#include "support/FileHandlerFixture.h"
#include "support/Rows.h"

namespace zelvo_test {
namespace {

struct NameRow {
    const char *row;
    std::string value;
    Text fullName; // behind the working directory, unless it begins with '!'
};

class ZlvFileHandlerNames : public FileHandlerFixture, public testing::WithParamInterface<NameRow> {
protected:
    Text expected() const
    {
        const Text &name = GetParam().fullName;
        if (!name)
            return name;
        return name->front() == '!' ? name->substr(1) : directory().string() + *name;
    }
};

TEST_P(ZlvFileHandlerNames, TakesTheRow)
{
    handler("fileName", GetParam().value.c_str());
    EXPECT_EQ(peeked(vars()->fullName), expected());
}

const std::string longName(252, 'n');

INSTANTIATE_TEST_SUITE_P(
    Rows, ZlvFileHandlerNames,
    testing::Values(NameRow{"Plain", "app.log", "/app.log"},
                    NameRow{"DigitBeforeTheDot", "app2.log", "/app2_.log"},
                    NameRow{"DigitsBeforeTheDot", "app12.log", "/app12_.log"},
                    NameRow{"DigitWithoutADot", "app2", "/app2_"},
                    NameRow{"DigitInTheExtension", "app.1", "/app.1"},
                    NameRow{"NothingButADigit", "7.log", "/7_.log"},
                    NameRow{"Backslash", "logs\\run.txt", "!logs//run.txt"},
                    NameRow{"DigitInADirectoryAlone", "v1.2/app", "/v1_.2/app"},
                    NameRow{"Absolute", "/var/log/app3.log", "!/var/log//app3_.log"},
                    NameRow{"UnderTheRoot", "/x.log", "//x.log"},
                    NameRow{"Of255Bytes", longName.substr(1) + ".log",
                            "/" + longName.substr(1) + ".log"},
                    NameRow{"Of256Bytes", longName + ".log", "/" + longName + ".log"},
                    NameRow{"Of257Bytes", longName + "n.log", {}},
                    NameRow{"Of255BytesEndingInADigit", longName.substr(2) + "1.log",
                            "/" + longName.substr(2) + "1_.log"},
                    NameRow{"Of256BytesEndingInADigit", longName.substr(1) + "1.log", {}}),
    byRow);

using ZlvFileHandlerName = FileHandlerFixture;

TEST_F(ZlvFileHandlerName, ThatIsRemovedLeavesNoFile)
{
    handler("fileName", "app.log", "fileName", nullptr);
    EXPECT_EQ(vars()->fullName, nullptr);
    EXPECT_EQ(vars()->directory, nullptr);
    EXPECT_EQ(vars()->base, nullptr);
    EXPECT_EQ(vars()->extension, nullptr);
}

TEST_F(ZlvFileHandlerName, ThatIsNewIsTakenByTheNextRecord)
{
    framedHandler("fileName", "app.log");
    log(u"a");
    set("fileName", "next.log");
    EXPECT_EQ(file("app.log"), "[\na\n]\n");
    log(u"b");
    EXPECT_EQ(file("next.log"), "[\nb\n");
}

} // namespace
} // namespace zelvo_test

// SPDX-License-Identifier: Apache-2.0
// Formatters that do something to the very handler that has asked them for a record, a header or a
// trailer: destroy it, close its descriptor, open it once more.
#include <utility>

#include "ZlvFileHandlerIntl.h"
#include "support/FileHandlerFixture.h"
#include "support/Rows.h"

namespace zelvo_test {
namespace {

/// What the formatters of the class Meddler::className do before they give their texts.
class Meddler {
public:
    static constexpr const char *className = "test_meddler";

    static void addClass()
    {
        onFormat = onHeader = onTrailer = {};
        ZlvAddUFormatterClass(className, nullptr, nullptr, nullptr, nullptr, format, header,
                              trailer, nullptr);
    }

    inline static std::function<void()> onFormat, onHeader, onTrailer;
    inline static const char16_t *record; ///< null for none

private:
    /// Meddles once: what it does may well ask for the text again.
    static void run(std::function<void()> &meddle)
    {
        if (const auto once = std::exchange(meddle, {}))
            once();
    }

    static UChar *format(ZlvObject *, ZlvEvent *, va_list)
    {
        run(onFormat);
        return CxUStringDup(record);
    }
    static char *header(ZlvObject *)
    {
        run(onHeader);
        return RkoStringDup("[\n");
    }
    static char *trailer(ZlvObject *)
    {
        run(onTrailer);
        return RkoStringDup("]\n");
    }
};

/// Tests with a handler that they alone hold, and call its entries as its class may, with nobody
/// else holding it meanwhile.
template <class Fixture>
class Foreign : public Fixture {
protected:
    void SetUp() override
    {
        Fixture::SetUp();
        Meddler::addClass();
        Meddler::record = u"record\n";
    }

    template <class... Properties>
    void make(const char *className, Properties... properties)
    {
        this->handler_ = ZlvGetObject("log", className);
        ZlvHandlerSetFormatter(this->handler_, this->formatter("meddler", Meddler::className));
        this->set("fileName", "app.log", properties...);
    }

    /// Gives the handler back, with another object before it.
    void destroy()
    {
        zlvIntlReleaseObject(std::exchange(other_, nullptr));
        zlvIntlReleaseObject(std::exchange(this->handler_, nullptr));
    }
    std::function<void()> destroys()
    {
        other_ = ZlvGetObject("other", "zlv_basiclogger");
        return [this] { destroy(); };
    }
    bool isDestroyed() const { return this->handler_ == nullptr; }

    /// Hands the handler an event; the status that it leaves.
    CxStatus process(void (*entry)(ZlvObject *, ZlvEvent *, va_list), ...)
    {
        zelvo::ApiLock lock;
        ZlvEvent event{};
        event.status = {CX_STATUS_OK, 0};
        va_list none;
        va_start(none, entry);
        entry(this->handler_, &event, none);
        va_end(none);
        return event.status;
    }

private:
    ZlvObject *other_ = nullptr;
};

class ZlvFileHandlerForeign : public Foreign<FileHandlerFixture> {
protected:
    template <class... Properties>
    void make(Properties... properties)
    {
        Foreign::make("zlv_filehandler", properties...);
    }

    CxStatus process() { return Foreign::process(ZlvFileUHandlerFProcess); }

    void release()
    {
        zelvo::ApiLock lock;
        destroy();
    }
};

TEST_F(ZlvFileHandlerForeign, ADestroyedHandlerHasNoVariablesWhateverElseWasDestroyed)
{
    make();
    ZlvObject *other = ZlvGetObject("other", "zlv_basiclogger");
    zelvo::ApiLock lock;
    zlvIntlReleaseObject(other);
    const ZlvObject *dead = handler_;
    zlvIntlReleaseObject(handler_);
    EXPECT_EQ(dead->vars, nullptr);
}

TEST_F(ZlvFileHandlerForeign, AHeaderThatDestroysTheHandlerIsNotWritten)
{
    make();
    Meddler::onHeader = destroys();
    EXPECT_TRUE(succeeded(openHandler()));
    EXPECT_TRUE(isDestroyed());
    EXPECT_EQ(file("app.log"), "");
}

TEST_F(ZlvFileHandlerForeign, ATrailerThatDestroysTheHandlerIsNotWritten)
{
    make();
    openHandler();
    Meddler::onTrailer = destroys();
    closeHandler();
    EXPECT_TRUE(isDestroyed());
    EXPECT_EQ(file("app.log"), "[\n");
}

TEST_F(ZlvFileHandlerForeign, ADestroyedHandlerMakesNoNewFileForOneThatIsGone)
{
    make();
    openHandler();
    std::filesystem::remove("app.log");
    Meddler::onTrailer = destroys();
    EXPECT_TRUE(succeeded(process()));
    EXPECT_TRUE(isDestroyed());
    EXPECT_EQ(file("app.log"), std::nullopt);
}

TEST_F(ZlvFileHandlerForeign, ADestroyedHandlerDoesNotRollAnOpenFileOver)
{
    make("maxFileSize", "9");
    process();
    Meddler::onTrailer = destroys();
    EXPECT_TRUE(succeeded(process()));
    EXPECT_TRUE(isDestroyed());
    EXPECT_EQ(file("app.log"), "[\nrecord\n");
    EXPECT_EQ(rolled(1), std::nullopt);
}

TEST_F(ZlvFileHandlerForeign, ADestroyedHandlerDoesNotRollAFileOverThatWasFullBefore)
{
    write("app.log", "full");
    make("maxFileSize", "4");
    Meddler::onTrailer = destroys();
    EXPECT_TRUE(succeeded(openHandler()));
    EXPECT_TRUE(isDestroyed());
    EXPECT_EQ(file("app.log"), "full");
    EXPECT_EQ(rolled(1), std::nullopt);
}

TEST_F(ZlvFileHandlerForeign, ARecordWhoseMakingDestroysTheHandlerIsNotWritten)
{
    make();
    Meddler::onFormat = destroys();
    EXPECT_TRUE(succeeded(process()));
    EXPECT_TRUE(isDestroyed());
    EXPECT_EQ(file("app.log"), "[\n]\n");
}

TEST_F(ZlvFileHandlerForeign, NoRecordMayCostTheHandlerToo)
{
    make();
    Meddler::record = nullptr;
    Meddler::onFormat = destroys();
    EXPECT_TRUE(succeeded(process()));
    EXPECT_TRUE(isDestroyed());
    EXPECT_EQ(file("app.log"), "[\n]\n");
}

TEST_F(ZlvFileHandlerForeign, AHeaderThatDestroysTheHandlerEndsTheSecondAttemptAtARecord)
{
    make();
    openHandler();
    ::close(vars()->file);
    Meddler::onHeader = destroys();
    EXPECT_TRUE(succeeded(process()));
    EXPECT_TRUE(isDestroyed());
    EXPECT_EQ(file("app.log"), "[\n");
}

TEST_F(ZlvFileHandlerForeign, AHeaderCannotOpenOrCloseTheFile)
{
    make();
    Meddler::onHeader = [this] {
        EXPECT_TRUE(succeeded(ZlvFileHandlerFOpenWithErr(handler_)));
        ZlvFileHandlerFClose(handler_);
        EXPECT_EQ(vars()->isOpen, 1);
    };
    EXPECT_TRUE(succeeded(openHandler()));
    EXPECT_EQ(file("app.log"), "[\n");
    release();
}

TEST_F(ZlvFileHandlerForeign, ADescriptorClosedBehindAMeasuredFileFailsTheRecord)
{
    make();
    write("other.log", "other\n");
    openHandler();
    std::filesystem::rename("other.log", "app.log"); // what is open is not what the name leads to
    Meddler::onFormat = [this] { ::close(vars()->file); };
    EXPECT_TRUE(failedWith(process(), EBADF));
    EXPECT_EQ(file("app.log"), "other\n");
    release();
}

struct Key {
    const char *row;
};

/// The properties that close the file.
class ZlvFileHandlerForeignKey : public ZlvFileHandlerForeign,
                                 public testing::WithParamInterface<Key> {};

TEST_P(ZlvFileHandlerForeignKey, HasNoEffectOnAHandlerThatItsClosingDestroys)
{
    make(GetParam().row, "640");
    setProp(handler_, "fileName", "app.log");
    openHandler();
    Meddler::onTrailer = destroys();
    {
        zelvo::ApiLock lock;
        ZlvFileHandlerFCfgChange(handler_, GetParam().row);
    }
    EXPECT_TRUE(isDestroyed());
}

INSTANTIATE_TEST_SUITE_P(Rows, ZlvFileHandlerForeignKey,
                         testing::Values(Key{"maxFileSize"}, Key{"maxFiles"}, Key{"fileName"},
                                         Key{"appending"}, Key{"filePermission"},
                                         Key{"dirPermission"}, Key{"fileEncoding"},
                                         Key{"MPFileSemKey"}),
                         byRow);

class ZlvMultiProcForeign : public Foreign<MultiProcFixture> {};

TEST_F(ZlvMultiProcForeign, ARecordWhoseMakingDestroysTheHandlerIsNotWritten)
{
    make("zlv_multiproc_filehandler", "MPFileSemKey", std::to_string(key_).c_str());
    Meddler::onFormat = destroys();
    EXPECT_TRUE(succeeded(process(ZlvMultiProcFileUHandlerFProcess)));
    EXPECT_TRUE(isDestroyed());
    EXPECT_EQ(file("app.log"), "");
    EXPECT_EQ(semValue(), 1);
}

} // namespace
} // namespace zelvo_test

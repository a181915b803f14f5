// SPDX-License-Identifier: Apache-2.0
// An open toolkit with one event at a fixed moment in a fixed zone, so that tests can compare the
// whole record that a formatter makes of it.
#pragma once

#include <unicode/ucal.h>

#include "support/Bundles.h"
#include "support/Elements.h"
#include "support/ToolkitFixture.h"
#include "support/VaList.h"
#include "zelvo.h"

/// The event's date, and the Time element of its XML records, as parts of literals.
#define RECORD_DATE u"2006-08-16 08:48:55.123+00:00"
#define RECORD_TIME u" <Time Millis=\"1155718135123\">" RECORD_DATE u"</Time>\n"

namespace zelvo_test {

class RecordFixture : public ToolkitFixture {
protected:
    void SetUp() override
    {
        open();
        zone(u"UTC");
        text(u"text");
    }

    void TearDown() override
    {
        ZlvFreeEvent(event_);
        ToolkitFixture::TearDown();
    }

    static void zone(const char16_t *id)
    {
        UErrorCode status = U_ZERO_ERROR;
        ucal_setDefaultTimeZone(id, &status);
        ASSERT_LE(status, U_ZERO_ERROR);
    }

    /// The event of the next records: with an inline text, or with a key of a bundle.
    void text(const char16_t *pattern, ZlvLevel level = ZLV_LEVEL_NONE)
    {
        event(ZlvVaAllocUEvent(level, nullptr, nullptr, pattern, noArgs()));
    }
    void key(const char *key, const char *bundle = bundlePath)
    {
        event(ZlvVaAllocUEvent(ZLV_LEVEL_NONE, bundle, key, nullptr, noArgs()));
    }

    void set(const char *property, const char *value) { ZlvSetEventProp(event_, property, value); }
    void set(const char *property, int32_t value) { ZlvSetEventPropInt(event_, property, value); }

    /// The record that FORMATTER makes of the event, with ARGUMENTS for its message.
    template <class... Arguments>
    UText recordBy(ZlvObject *formatter, Arguments... arguments)
    {
        UText record;
        withArgs(
            [&](va_list args) {
                HeldMutex held;
                ZlvFFormat format = formatter->objClass->formatter.fFormat;
                record = taken(format(formatter, event_, args));
            },
            arguments...);
        return record;
    }

    ZlvEvent *event_ = nullptr;

private:
    void event(ZlvEvent *fresh)
    {
        ZlvFreeEvent(event_);
        event_ = fresh;
        event_->time = 1155718135123.0;
    }
};

/// The same with an XML formatter.
class XMLRecordFixture : public RecordFixture {
protected:
    void SetUp() override
    {
        RecordFixture::SetUp();
        formatter_ = formatter("xml", "zlv_xmlformatter");
    }

    PDXMLFormatterVars *vars() const { return static_cast<PDXMLFormatterVars *>(formatter_->vars); }

    template <class... Arguments>
    UText record(Arguments... arguments)
    {
        return recordBy(formatter_, arguments...);
    }

    ZlvObject *formatter_ = nullptr;
};

} // namespace zelvo_test

// SPDX-License-Identifier: Apache-2.0
// A message-ID filter between a logger and a recorder.
#pragma once

#include "ZlvEvent.h"
#include "ZlvLevelFilter.h"
#include "ZlvMsgIdFilter.h"
#include "support/Recorder.h"
#include "support/VaList.h"

namespace zelvo_test {

/// An event without level that a test sends by itself, with a text that holds no identifier.
class OwnEvent {
public:
    explicit OwnEvent(const UChar *text = u"no identifier")
        : event_(ZlvVaAllocUEvent(ZLV_LEVEL_NONE, nullptr, nullptr, text, noArgs()))
    {
    }
    OwnEvent(const OwnEvent &) = delete;
    OwnEvent &operator=(const OwnEvent &) = delete;
    ~OwnEvent() { ZlvFreeEvent(event_); }

    ZlvEvent *get() const { return event_; }
    ZlvEvent *operator->() const { return event_; }
    Text messageId() const { return taken(ZlvGetEventMessageId(event_)); }

private:
    ZlvEvent *event_;
};

/// The logger "app" sends to the filter "ids", which passes on to the recorder.
class MsgIdFilterFixture : public RecordedToolkit {
protected:
    void SetUp() override
    {
        RecordedToolkit::SetUp();
        ZlvRemListener(app_, recorder_);
        ids_ = filter("ids", "zlv_msgidfilter");
        ZlvAddListener(app_, ids_);
        ZlvAddListener(ids_, recorder_);
    }

    MsgIdFilterVars *vars() const { return static_cast<MsgIdFilterVars *>(ids_->vars); }

    /// Whether an event with the identifier ID (null: with none), made at TIME, passes.
    bool passes(const char *id, double time = 1000)
    {
        OwnEvent event;
        ZlvSetEventMessageId(event.get(), id);
        event->time = time;
        Recorder::clear();
        ZlvBasicFilterFProcess(ids_, event.get(), noArgs());
        return !records().empty();
    }

    /// Whether an event with the text TEXT, sent by a logger, passes.
    bool passesText(const UChar *text)
    {
        Recorder::clear();
        ZlvLogUText(app_, text);
        return !records().empty();
    }

    Names patterns() const
    {
        Names all;
        const StringListNode *node = vars()->patterns ? vars()->patterns->first : nullptr;
        for (; node != nullptr; node = node->next)
            all.emplace_back(node->element);
        return all;
    }

    /// What the filter noted of the identifier ID.
    Text lastPassed(const char *id) const
    {
        return taken(zlvIntlStringToStringMapGet(vars()->lastPassed, id));
    }

    ZlvObject *ids_ = nullptr;
};

} // namespace zelvo_test

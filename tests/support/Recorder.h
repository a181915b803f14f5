// SPDX-License-Identifier: Apache-2.0
// A handler class that keeps what it gets, for tests of everything that sends events.
#pragma once

#include <map>
#include <string>
#include <vector>

#include "ZlvIntl.h"
#include "support/Text.h"
#include "support/ToolkitFixture.h"

namespace zelvo_test {

/// What a recorder kept of one event, read while the event was in its hands.
struct Record {
    std::string by; ///< name of the recorder
    ZlvLevel level;
    bool isMessage;
    UText text; ///< the message, bound in its own locale
    std::map<std::string, std::string> properties;
    Text messageId;
};

/// The class Recorder::className, whose handlers add to one list of records. They keep no open or
/// closed state, use no formatter and pass nothing on.
class Recorder {
public:
    static constexpr const char *className = "test_recorder";

    /// Registers the class, with an empty list and no status to leave.
    static void addClass()
    {
        records_.clear();
        leaves_ = {CX_STATUS_OK, 0};
        ZlvAddHandlerClass(className, nullptr, nullptr, nullptr, ZlvBasicHandlerFCfgChange, process,
                           nullptr, nullptr);
    }

    static const std::vector<Record> &records() { return records_; }
    static void clear() { records_.clear(); }

    /// From now on recorders store STATUS in each event, as a handler that fails does.
    static void leave(CxStatus status) { leaves_ = status; }

    /// The names of the recorders in the order in which they got their events.
    static std::vector<std::string> order()
    {
        std::vector<std::string> names;
        for (const Record &record : records_)
            names.push_back(record.by);
        return names;
    }

private:
    static void process(ZlvObject *handler, ZlvEvent *event, va_list args)
    {
        records_.push_back({handler->name, ZlvGetEventLevel(event),
                            ZlvGetEventIsMessage(event) == 1,
                            taken(zlvIntlBindUI18Msg(event->message, args)), propertiesOf(event),
                            taken(ZlvGetEventMessageId(event))});
        if (leaves_.type != CX_STATUS_OK)
            event->status = leaves_;
    }

    static std::map<std::string, std::string> propertiesOf(const ZlvEvent *event)
    {
        std::map<std::string, std::string> all;
        if (event->properties == nullptr)
            return all;
        for (auto *node = event->properties->first; node; node = node->next)
            all[node->key ? node->key : "(null)"] = node->value ? node->value : "(null)";
        return all;
    }

    inline static std::vector<Record> records_;
    inline static CxStatus leaves_{CX_STATUS_OK, 0};
};

/// An open toolkit with the logger "app", whose one listener is the recorder "recorder".
class RecordedToolkit : public ToolkitFixture {
protected:
    void SetUp() override
    {
        open();
        Recorder::addClass();
        app_ = logger("app");
        recorder_ = handler("recorder", Recorder::className);
        ZlvAddListener(app_, recorder_);
    }

    static const std::vector<Record> &records() { return Recorder::records(); }

    ZlvObject *app_ = nullptr;
    ZlvObject *recorder_ = nullptr;
};

} // namespace zelvo_test

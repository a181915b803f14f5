// SPDX-License-Identifier: Apache-2.0
// A problem-determination logger on a host of a known name, and what its listener gets.
#pragma once

#include <cstring>
#include <map>
#include <string>

#include "ZlvPDLogger.h"
#include "support/FakeSystem.h"
#include "support/MsgIdFilterFixture.h"

namespace zelvo_test {

/// The logger "pd" sends to the recorder.
class PDLoggerFixture : public RecordedToolkit {
protected:
    using Properties = std::map<std::string, std::string>;

    void SetUp() override
    {
        hostIs("node.example.org");
        RecordedToolkit::SetUp();
        pd_ = pdLogger("pd");
    }

    void hostIs(const std::string &name)
    {
        system_.gethostname = [name](char *own, size_t size) {
            std::strncpy(own, name.c_str(), size);
            return 0;
        };
    }
    void hostIsUnknown()
    {
        system_.gethostname = [](char *, size_t) { return -1; };
    }

    /// A logger that sends to the recorder.
    ZlvObject *pdLogger(const char *name)
    {
        ZlvObject *made = logger(name, "zlv_pdlogger");
        ZlvAddListener(made, recorder_);
        return made;
    }

    static PDLoggerVars *varsOf(const ZlvObject *logger)
    {
        return static_cast<PDLoggerVars *>(logger->vars);
    }

    /// What the recorder gets of an event of TEXT that LOGGER logs.
    static const Record &logged(ZlvObject *logger, const UChar *text = u"text")
    {
        Recorder::clear();
        ZlvLogUText(logger, text);
        return records().at(0);
    }

    /// The properties of such an event, process and thread left out.
    static Properties stamped(ZlvObject *logger)
    {
        Properties all = logged(logger).properties;
        all.erase("processId");
        all.erase("threadId");
        return all;
    }

    FakeSystem system_;
    ZlvObject *pd_ = nullptr;
};

} // namespace zelvo_test

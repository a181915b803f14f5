// SPDX-License-Identifier: Apache-2.0
// The stage for destructive orders of events: those that a walk or a count could fall over. Under
// the address sanitizer none of the tests may give a report.
#pragma once

#include "support/Recorder.h"
#include "support/Scripted.h"

#include "ZlvHandler.h"
#include "ZlvOwned.h"

namespace zelvo_test {

/// An open toolkit with the recorder class and the scripted ones.
class ZlvDestructiveOrders : public ToolkitFixture {
protected:
    void SetUp() override
    {
        open();
        addClasses();
    }

    static void addClasses()
    {
        Recorder::addClass();
        Scripted::addClasses();
    }

    /// Closes and opens with the text PROPERTIES.
    void reopen(const std::string &properties)
    {
        close();
        open(properties);
        addClasses();
    }

    static bool exists(const char *name)
    {
        return zlvIntlStringToObjMapHasKey(ZLV_TK_INSTANCES, name) == 1;
    }
    static ZlvObject *get(const char *name, const char *className)
    {
        return ZlvGetObject(name, className);
    }
    /// Makes an object that only OBJECT holds, as its listener.
    static ZlvObject *addOwn(ZlvObject *object, const char *name,
                             const char *className = Scripted::handler)
    {
        ZlvObject *listener = get(name, className);
        ZlvAddListener(object, listener);
        ZlvReleaseObject(listener);
        return listener;
    }
};

} // namespace zelvo_test

// SPDX-License-Identifier: Apache-2.0
// A fixture around one life of the toolkit: opens it, gives tests their vocabulary, closes it and
// checks that nothing is left.
#pragma once

#include <functional>
#include <iterator>
#include <vector>

#include "ZlvListenerGroup.h"
#include "ZlvLogger.h"
#include "ZlvObject.h"
#include "ZlvToolkit.h"
#include "ZlvToolkitIntl.h"
#include "support/TestDir.h"
#include "support/Text.h"

namespace zelvo_test {

/// Tests begin with a closed toolkit: most of them call open() first. Objects that come from the
/// fixture's calls are released by it just before the toolkit closes.
class ToolkitFixture : public TestDir {
protected:
    using Names = std::vector<std::string>;

    void TearDown() override
    {
        close();
        EXPECT_EQ(ZLV_TK_INSTANCES, nullptr);
        EXPECT_EQ(ZLV_TK_CLASSES, nullptr);
        EXPECT_EQ(ZLV_TK_CFG_DATA, nullptr);
        EXPECT_EQ(openDescriptors(), descriptorsBefore_);
    }

    /// Opens the toolkit without a file; with one that holds the text PROPERTIES.
    void open() { ASSERT_EQ(ZlvOpenToolkit(nullptr, &error_), 1); }
    void open(const std::string &properties) { ASSERT_EQ(tryOpen(properties), 1); }

    /// The result of opening with a file that holds the text PROPERTIES, for those that may fail.
    ZlvBool tryOpen(const std::string &properties)
    {
        return ZlvOpenToolkit(write("zelvo.properties", properties).c_str(), &error_);
    }

    /// What open left in the error record, which says '-' and 0 before.
    const CxStatus &error() const { return error_; }

    /// Releases the fixture's objects and closes the toolkit; harmless when it is closed.
    void close()
    {
        for (ZlvObject *object : objects_)
            ZlvReleaseObject(object);
        objects_.clear();
        ZlvCloseToolkit();
    }

    /// Leaves a reference to the fixture, which releases it at close.
    ZlvObject *keep(ZlvObject *object)
    {
        objects_.push_back(object);
        return object;
    }

    /// Create-or-get of an object that the fixture releases; without a class the configuration
    /// names it.
    ZlvObject *object(const char *name, const char *className = nullptr)
    {
        return keep(ZlvGetObject(name, className));
    }
    ZlvObject *logger(const char *name, const char *className = "zlv_basiclogger")
    {
        return object(name, className);
    }
    ZlvObject *filter(const char *name, const char *className = "zlv_levelfilter")
    {
        return object(name, className);
    }
    ZlvObject *handler(const char *name, const char *className = "zlv_consolehandler")
    {
        return object(name, className);
    }
    ZlvObject *formatter(const char *name, const char *className = "zlv_basicformatter")
    {
        return object(name, className);
    }

    static void setProp(ZlvObject *object, const char *property, const char *value)
    {
        ZlvSetObjProp(object, property, value);
    }
    static Text prop(ZlvObject *object, const char *property)
    {
        return taken(ZlvGetObjProp(object, property, nullptr));
    }

    /// The names of the objects that listen to OBJECT, in their order.
    static Names listeners(ZlvObject *object)
    {
        Names names;
        for (ListenerGroupIterator at = ZlvGetListeners(object); ZlvListenerGroupIterHasNext(at);
             at = ZlvListenerGroupIterNext(at)) {
            ZlvObject *listener = ZlvListenerGroupIterGet(at);
            names.push_back(taken(ZlvGetObjectName(listener)).value_or("(none)"));
            ZlvReleaseObject(listener);
        }
        return names;
    }

    /// Logs TEXT, a pattern without arguments, as an event without level.
    static ZlvStatus log(ZlvObject *logger, const char16_t *text)
    {
        return ZlvLogUText(logger, text);
    }

    /// What ACTION writes to standard output.
    static std::string console(const std::function<void()> &action)
    {
        testing::internal::CaptureStdout();
        action();
        return testing::internal::GetCapturedStdout();
    }

    /// The number of descriptors that this process has open.
    static std::ptrdiff_t openDescriptors()
    {
        std::filesystem::directory_iterator all("/proc/self/fd");
        return std::distance(begin(all), end(all));
    }

private:
    std::ptrdiff_t descriptorsBefore_ = openDescriptors();
    CxStatus error_{CX_STATUS_OK, 0};
    std::vector<ZlvObject *> objects_;
};

} // namespace zelvo_test

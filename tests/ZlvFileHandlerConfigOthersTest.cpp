// SPDX-License-Identifier: Apache-2.0
// The configuration change of file handlers, used by what is no file handler, and without memory.
#include "ZlvFileHandlerIntl.h"
#include "support/FailAlloc.h"
#include "support/FileHandlerFixture.h"

namespace zelvo_test {
namespace {

class ZlvFileHandlerConfigOthers : public FileHandlerFixture {
protected:
    /// Opens the file of an object with the variables of a file handler, and tells whether a change
    /// of its configuration takes effect and leaves the file open.
    static bool changesWithoutClosing(ZlvObject *object)
    {
        zelvo::ApiLock lock;
        auto *vars = static_cast<FileHandlerVars *>(object->vars);
        zelvo::openLogFile(*vars, 0);
        zlvIntlSetObjProp(object, "maxFiles", "7");
        ZlvFileHandlerFCfgChange(object, "maxFiles");
        return vars->maxFiles == 7 && vars->isOpen == 1;
    }
};

TEST_F(ZlvFileHandlerConfigOthers, OfAClassOfAnotherKindStayOpen)
{
    ZlvAddLoggerClass("own", nullptr, ZlvFileHandlerFAllocVars, ZlvFileHandlerFFreeVars,
                      ZlvFileHandlerFCfgChange, nullptr);
    EXPECT_TRUE(changesWithoutClosing(object("own", "own")));
}

/// The same with an object that no registry knows.
class ZlvFileHandlerConfigUnknown : public ZlvFileHandlerConfigOthers {
protected:
    static bool changesWithoutClosing(ZlvObjClass *objClass)
    {
        ZlvObject record{};
        record.objClass = objClass;
        record.vars = ZlvFileHandlerFAllocVars();
        const bool result = ZlvFileHandlerConfigOthers::changesWithoutClosing(&record);
        ZlvFileHandlerFFreeVars(record.vars);
        zelvo::ApiLock lock;
        zlvIntlFreeStringToStringMap(record.properties);
        return result;
    }
};

TEST_F(ZlvFileHandlerConfigUnknown, WithoutAClassStayOpen)
{
    EXPECT_TRUE(changesWithoutClosing(nullptr));
}

TEST_F(ZlvFileHandlerConfigUnknown, OfAHandlerClassWithoutACloseEntryStayOpen)
{
    ZlvObjClass own{};
    own.kind = ZLV_KIND_HANDLER;
    EXPECT_TRUE(changesWithoutClosing(&own));
}

TEST_F(ZlvFileHandlerConfigOthers, WithoutMemoryForTheWholeNameHaveNoName)
{
    handler("fileName", "trace7.log");
    for (uint32_t allowed = 0;; ++allowed) {
        zelvo::ApiLock lock;
        FailAlloc fail(allowed, FailAlloc::Once);
        ZlvFileHandlerFCfgChange(handler_, "fileName");
        if (fail.failed() == 0)
            break;
        const Text name = taken(RkoStringDup(vars()->fullName));
        EXPECT_TRUE(!name || name->ends_with("/trace7_.log")) << *name;
    }
}

} // namespace
} // namespace zelvo_test

// SPDX-License-Identifier: Apache-2.0
#include "support/NullCallWorld.h"

#include "ZlvIntl.h"

namespace zelvo_test {
namespace {

const char *classOf(Kind kind)
{
    static constexpr const char *CLASSES[] = {
        "zlv_basiclogger",  "zlv_levelfilter",           "zlv_consolehandler", "zlv_basicformatter",
        "zlv_filehandler",  "zlv_multiproc_filehandler", "zlv_msgidfilter",    "zlv_pdlogger",
        "zlv_xmlformatter", "zlv_vyxtraceformatter"};
    return CLASSES[static_cast<size_t>(kind)];
}

} // namespace

NullCallWorld::NullCallWorld(Kind kind)
{
    ZlvOpenToolkit(nullptr, nullptr);
    object_ = ZlvGetObject("sample", classOf(kind));
    cfg_ = ZlvLogMgrGetCfg("cfg");
    event_ = ZlvVaAllocUEvent(ZLV_LEVEL_INFO, nullptr, nullptr, u"text", noArgs());
    parm_.type = ZLV_PARM_INT;
    CxMutexCreate(&mutex_);
    CxDirectoryOpen(&opened_, ".");
    directory_ = opened_;
    CxInitFilePath(&path_, "sample");
    CxStringBuffAppendStr(&buff_, "sample");
    CxUStringBuffAppendStr(&wideBuff_, "sample");
    CxPropListPutStr(&props_, "sample", "value");
    propsAt_ = CxPropListIterator(&props_);
    ZlvStrTokIterator(&tokens_, "one two", " ");
    ZlvStringListAppend(strings_ = ZlvAllocStringList(), "sample");
    ZlvParmListAppend(parms_ = ZlvAllocParmList(), &parm_);
    ZlvStringGroupAdd(names_ = ZlvAllocStringGroup(), "sample");
    ZlvListenerGroupAdd(listeners_ = ZlvAllocListenerGroup(), object_);
    ZlvStringToStringMapPut(texts_ = ZlvAllocStringToStringMap(), "sample", "5");
    ZlvStringToObjMapPut(objects_ = ZlvAllocStringToObjMap(), "sample", object_);
    ZlvStringToObjCfgMapPut(cfgs_ = ZlvAllocStringToObjCfgMap(), "sample", cfg_);
    ZlvStringToObjClassMapPut(classes_ = ZlvAllocStringToObjClassMap(), "sample",
                              object_->objClass);
}

NullCallWorld::~NullCallWorld()
{
    if (thread_ != 0)
        CxThreadJoin(thread_);
    ZlvFreeStringList(strings_);
    ZlvFreeParmList(parms_);
    ZlvFreeStringGroup(names_);
    ZlvFreeListenerGroup(listeners_);
    ZlvFreeStringToStringMap(texts_);
    ZlvFreeStringToObjMap(objects_);
    ZlvFreeStringToObjCfgMap(cfgs_);
    ZlvFreeStringToObjClassMap(classes_);
    CxStringBuffDiscard(&buff_);
    CxUStringBuffDiscard(&wideBuff_);
    CxPropListDiscard(&props_);
    CxDirectoryClose(&opened_);
    CxMutexDestroy(&mutex_);
    ZlvFreeEvent(event_);
    ZlvReleaseObjCfg(cfg_);
    ZlvReleaseObject(object_);
    ZlvCloseToolkit();
}

void release(const volatile void *result, char answer)
{
    void *mine = const_cast<void *>(result);
    if (answer == 'f')
        RkoMemoryFree(mine);
    else if (answer == 'o')
        ZlvReleaseObject(static_cast<ZlvObject *>(mine));
    else if (answer == 'v')
        ZlvFreeEvent(static_cast<ZlvEvent *>(mine));
    else if (answer == 'm')
        ZlvFreeI18Msg(static_cast<ZlvI18Msg *>(mine));
    else if (answer == 's')
        ZlvFreeStringList(static_cast<StringList *>(mine));
}

} // namespace zelvo_test

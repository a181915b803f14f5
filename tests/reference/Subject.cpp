// SPDX-License-Identifier: Apache-2.0
#include "Subject.h"

#include <sys/sem.h>
#include <unistd.h>

#include <stdexcept>

#include <unicode/uloc.h>

namespace zelvo_test {
namespace {

constexpr double FIXED_TIME = 1155718135123.0;

int ownKey()
{
    return 0x2a000000 + getpid();
}

bool isOfKind(const ZlvObject *object, uint32_t kind)
{
    return object->objClass->kind == kind;
}

} // namespace

Subject::Subject(const std::string &className)
{
    UErrorCode status = U_ZERO_ERROR;
    uloc_setDefault("en_US", &status);
    ZlvOpenToolkit(nullptr, nullptr);
    object_ = ZlvGetObject("subject", className.c_str());
    if (object_ == nullptr)
        throw std::runtime_error("there is no class " + className);
    source_ = ZlvGetObject("source", "zlv_basiclogger");
    output_ = ZlvGetObject("output", "zlv_consolehandler");
    if (isOfKind(object_, ZLV_KIND_HANDLER))
        ZlvAddListener(source_, object_);
    if (isOfKind(object_, ZLV_KIND_FORMATTER))
        ZlvHandlerSetFormatter(output_, object_);
}

Subject::~Subject()
{
    ZlvReleaseObject(source_);
    ZlvReleaseObject(output_);
    ZlvReleaseObject(object_);
    ZlvCloseToolkit();
    if (ownsSemaphore_)
        semctl(semget(ownKey(), 0, 0), 0, IPC_RMID);
}

bool Subject::isFileHandler() const
{
    return object_->objClass->fCfgChange == ZlvFileHandlerFCfgChange;
}

void Subject::configure(const char *key, const char *value)
{
    ZlvObjCfg *cfg = ZlvLogMgrGetCfg("subject");
    ZlvSetObjCfgProp(cfg, key, value);
    ZlvLogMgrApplyCfg(object_, "subject");
    ZlvReleaseObjCfg(cfg);
}

void Subject::takeOwnSemaphore()
{
    ZlvSetObjPropInt(object_, "MPFileSemKey", ownKey());
    ownsSemaphore_ = true;
}

void Subject::log()
{
    ZlvLogUText(source_, u"record");
}

void Subject::close()
{
    zlvAPIMutexLock();
    object_->objClass->handler.fClose(object_);
    zlvAPIMutexUnlock();
}

std::string Subject::render(ZlvEvent *event, double number)
{
    UChar *record = nullptr;
    withArgs([&](va_list args) { record = ZlvUHandlerDoFmt(output_, event, args); }, number);
    char *bytes = CxUStringDupUCharToStr(record);
    RkoMemoryFree(record);
    return textOf(bytes);
}

Event::Event(const UChar *text, ZlvLevel level) : event_(nullptr)
{
    withArgs([&](va_list args) { event_ = ZlvVaAllocUEvent(level, nullptr, nullptr, text, args); });
    event_->time = FIXED_TIME;
}

std::string textOf(char *owned)
{
    const std::string text = owned != nullptr ? owned : "none";
    RkoMemoryFree(owned);
    return text;
}

} // namespace zelvo_test

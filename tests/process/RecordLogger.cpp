// SPDX-License-Identifier: Apache-2.0
#include "process/RecordLogger.h"

#include "process/Records.h"

namespace zelvo_test {

namespace {

UChar *formatLine(ZlvObject *, ZlvEvent *event, va_list args)
{
    UChar *text = ZlvBindEventUMsg(event, zlvIntlBindUI18Msg, args);
    CxUStringBuff line{};
    CxUStringBuffAppendUStr(&line, text);
    CxUStringBuffAppendUStr(&line, u"\n");
    RkoMemoryFree(text);
    return CxUStringBuffTakeUStr(&line);
}

} // namespace

void addLineFormatter()
{
    ZlvAddUFormatterClass(LINE_FORMATTER, nullptr, nullptr, nullptr, nullptr, formatLine, nullptr,
                          nullptr, nullptr);
}

ZlvObject *makeRecordLogger(const char *handlerClass, const Job &job, const std::string &name)
{
    addLineFormatter();
    ZlvObject *logger = ZlvGetObject((name + ".log").c_str(), "zlv_basiclogger");
    ZlvObject *handler = ZlvGetObject((name + ".file").c_str(), handlerClass);
    ZlvObject *formatter = ZlvGetObject((name + ".line").c_str(), LINE_FORMATTER);
    ZlvHandlerSetFormatter(handler, formatter);
    ZlvSetObjProp(handler, "fileName", job.file.c_str());
    ZlvSetObjPropInt(handler, "maxFileBytes", job.maxBytes);
    ZlvSetObjPropInt(handler, "maxFiles", job.maxFiles);
    ZlvSetObjPropInt(handler, "MPFileSemKey", job.key);
    ZlvAddListener(logger, handler);
    ZlvReleaseObject(formatter);
    ZlvReleaseObject(handler);
    return logger;
}

bool logRecord(ZlvObject *logger, const Job &job, uint32_t number)
{
    const std::string text = recordText(job.seed, job.writer, number);
    const std::u16string wide(text.begin(), text.end());
    return ZlvLogUText(logger, u"{0}", wide.c_str()).type == CX_STATUS_OK;
}

} // namespace zelvo_test

// SPDX-License-Identifier: Apache-2.0
// The record of a message, and the way a text reaches a C stream. ZlvI18MsgBind.cpp binds.
#include "ZlvI18Msg.h"

#include <cstdio>

#include <unicode/ustdio.h>
#include <unicode/ustring.h>

#include "CxMemory.h"
#include "CxString.h"
#include "CxUString.h"
#include "ZlvApiMutex.h"
#include "ZlvLocaleName.h"

using namespace zelvo;

namespace {

/// Tells whether every part that was there to copy has been copied.
bool isWhole(const ZlvI18Msg *message, const char *bundle, const char *key, const UChar *text)
{
    return (message->bundle != nullptr || bundle == nullptr) &&
           (message->key != nullptr || key == nullptr) &&
           (message->text != nullptr || text == nullptr);
}

} // namespace

ZlvI18Msg *zlvIntlAllocUI18Msg(const char *bundle, const char *key, const UChar *text)
{
    auto *message = static_cast<ZlvI18Msg *>(RkoMemoryCalloc(1, sizeof(ZlvI18Msg)));
    if (message == nullptr)
        return nullptr;
    message->bundle = RkoStringDup(bundle);
    message->key = RkoStringDup(key);
    message->text = CxUStringDup(text);
    if (isWhole(message, bundle, key, text))
        return message;
    zlvIntlFreeI18Msg(message);
    return nullptr;
}

ZlvI18Msg *ZlvAllocUI18Msg(const char *bundle, const char *key, const UChar *text)
{
    return locked(zlvIntlAllocUI18Msg, bundle, key, text);
}

ZlvI18Msg *zlvIntlCopyI18Msg(const ZlvI18Msg *message)
{
    if (message == nullptr)
        return nullptr;
    ZlvI18Msg *copy = zlvIntlAllocUI18Msg(message->bundle, message->key, message->text);
    if (copy == nullptr)
        return nullptr;
    copy->parameters = zlvIntlCopyParmList(message->parameters);
    copy->locale = message->locale;
    copy->icuError = message->icuError;
    if (copy->parameters != nullptr || message->parameters == nullptr)
        return copy;
    zlvIntlFreeI18Msg(copy);
    return nullptr;
}

ZlvI18Msg *ZlvCopyI18Msg(const ZlvI18Msg *message)
{
    return locked(zlvIntlCopyI18Msg, message);
}

void zlvIntlFreeI18Msg(ZlvI18Msg *message)
{
    if (message == nullptr)
        return;
    RkoMemoryFree(message->bundle);
    RkoMemoryFree(message->key);
    RkoMemoryFree(message->text);
    zlvIntlFreeParmList(message->parameters);
    RkoMemoryFree(message);
}

void ZlvFreeI18Msg(ZlvI18Msg *message)
{
    locked(zlvIntlFreeI18Msg, message);
}

ParmList *zlvGetI18MsgParmList(ZlvI18Msg *message)
{
    if (message == nullptr)
        return nullptr;
    if (message->parameters == nullptr)
        message->parameters = zlvIntlAllocParmList();
    return message->parameters;
}

const char *zlvSetI18MsgLocale(ZlvI18Msg *message, const char *locale)
{
    if (message != nullptr)
        message->locale = internLocaleName(locale);
    return locale;
}

int32_t zlvI18PrintUCharAsLocal(FILE *stream, const UChar *text)
{
    if (stream == nullptr || text == nullptr)
        return 0;
    UFILE *file = u_finit(stream, nullptr, nullptr);
    if (file == nullptr)
        return 0;
    u_file_write(text, u_strlen(text), file);
    u_fputc(u'\n', file);
    u_fclose(file); // flushes the C stream too, and leaves it open
    return 0;
}

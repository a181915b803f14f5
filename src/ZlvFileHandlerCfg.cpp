// SPDX-License-Identifier: Apache-2.0
// The properties of the two file handlers.
//
// Closing runs foreign code: the close entry of the object's own class, which is not always this
// library's, and the making of a trailer. Each property is therefore read before, and the variables
// are asked for afterwards.
#include "ZlvFileHandler.h"

#include <cstdio>
#include <cstring>
#include <utility>

#include "CxMemory.h"
#include "CxString.h"
#include "ZlvFileHandlerIntl.h"
#include "ZlvIntl.h"
#include "util/CxOwned.h"

using namespace zelvo;

namespace {

constexpr int32_t LIMIT_IF_ABSENT = 1024;
constexpr int32_t FILES_IF_ABSENT = 3;

/// Closes the file, and gives the variables if they are still there.
FileHandlerVars *closed(ZlvObject *handler)
{
    const ZlvObjClass *objClass = handler->objClass;
    if (objClass != nullptr && objClass->kind == ZLV_KIND_HANDLER &&
        objClass->handler.fClose != nullptr)
        objClass->handler.fClose(handler);
    return varsOf(handler);
}

int32_t intProperty(ZlvObject *handler, const char *key, int32_t ifAbsent)
{
    ZlvBool found = 0;
    const int32_t value = zlvIntlGetObjPropInt(handler, key, &found);
    return found == 1 ? value : ifAbsent;
}

ZlvBool appendingProperty(ZlvObject *handler)
{
    ZlvBool found = 0;
    const ZlvBool value = zlvIntlGetObjPropBool(handler, "appending", &found);
    return found == 1 ? value : 1;
}

template <int32_t FileHandlerVars::*FIELD, int32_t IF_ABSENT>
void setInt(ZlvObject *handler, const char *key)
{
    const int32_t value = intProperty(handler, key, IF_ABSENT);
    if (FileHandlerVars *vars = closed(handler))
        vars->*FIELD = value;
}

template <uint32_t FileHandlerVars::*FIELD>
void setPermission(ZlvObject *handler, const char *key)
{
    const OwnedStr text{zlvIntlGetObjProp(handler, key, nullptr)};
    FileHandlerVars *vars = text ? closed(handler) : nullptr;
    uint32_t mode = 0;
    // NOLINTNEXTLINE(cert-err34-c): four digits cannot overflow.
    if (vars != nullptr && std::sscanf(text.get(), "%4o", &mode) == 1)
        vars->*FIELD = mode;
}

/// Copies a file name, with a '_' behind a digit that would be taken for a file's number.
char *dupFileName(const char *name)
{
    const int32_t digit = zlvFHTrailingBaseDigit(name);
    if (digit < 0)
        return RkoStringDup(name);
    const auto length = static_cast<size_t>(digit) + 1;
    const size_t size = std::strlen(name) + sizeof "_";
    auto *copy = static_cast<char *>(RkoMemoryMalloc(size));
    if (copy != nullptr)
        static_cast<void>(
            std::snprintf(copy, size, "%.*s_%s", static_cast<int>(length), name, name + length));
    return copy;
}

void setFileName(ZlvObject *handler, const char *key)
{
    const OwnedStr given{zlvIntlGetObjProp(handler, key, nullptr)};
    const OwnedStr name{dupFileName(given.get())};
    if (FileHandlerVars *vars = closed(handler))
        nameLogFile(*vars, name.get());
}

void setAppending(ZlvObject *handler, const char * /*key*/)
{
    const ZlvBool value = appendingProperty(handler);
    if (FileHandlerVars *vars = closed(handler))
        vars->appending = value;
}

void setEncoding(ZlvObject *handler, const char *key)
{
    OwnedStr text{zlvIntlGetObjProp(handler, key, nullptr)};
    if (FileHandlerVars *vars = closed(handler))
        RkoMemoryFree(std::exchange(vars->encoding, text.take()));
}

void setLogInternalErrs(ZlvObject *handler, const char * /*key*/)
{
    varsOf(handler)->logInternalErrs = appendingProperty(handler);
}

struct Setting {
    const char *key;
    void (*apply)(ZlvObject *handler, const char *key);
};

constexpr Setting SETTINGS[] = {
    {"maxFileSize", setInt<&FileHandlerVars::maxBytes, LIMIT_IF_ABSENT>},
    {"maxFileBytes", setInt<&FileHandlerVars::maxBytes, LIMIT_IF_ABSENT>},
    {"maxFiles", setInt<&FileHandlerVars::maxFiles, FILES_IF_ABSENT>},
    {"fileName", setFileName},
    {"appending", setAppending},
    {"filePermission", setPermission<&FileHandlerVars::filePermission>},
    {"dirPermission", setPermission<&FileHandlerVars::dirPermission>},
    {"fileEncoding", setEncoding},
    {"MPFileSemKey", setInt<&FileHandlerVars::semKey, 0>},
    {"logInternalErrs", setLogInternalErrs},
};

} // namespace

void ZlvFileHandlerFCfgChange(ZlvObject *handler, const char *propertyName)
{
    if (propertyName == nullptr || varsOf(handler) == nullptr)
        return;
    for (const Setting &setting : SETTINGS)
        if (RkoStringCmp(propertyName, setting.key) == 0)
            return setting.apply(handler, setting.key);
    ZlvBasicHandlerFCfgChange(handler, propertyName);
}

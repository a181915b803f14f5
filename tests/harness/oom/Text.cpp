// SPDX-License-Identifier: Apache-2.0
#include "Text.h"

namespace zelvo_test {
namespace {

std::string hex(unsigned value)
{
    constexpr const char *digits = "0123456789abcdef";
    std::string text;
    for (; value != 0; value /= 16)
        text.insert(text.begin(), digits[value % 16]);
    return text;
}

/// A character of ASCII as it is, any other as its number.
std::string unitText(unsigned unit)
{
    return unit >= 0x20 && unit < 0x7F ? std::string(1, static_cast<char>(unit))
                                       : "\\" + hex(unit) + ";";
}

/// The text of each unit, with runs of the same unit counted.
template <class Unit>
std::string quoted(const Unit *text)
{
    std::string result = "'";
    while (*text != 0) {
        const Unit *end = text;
        while (*end == *text)
            ++end;
        result += unitText(static_cast<std::make_unsigned_t<Unit>>(*text));
        if (end - text > 1)
            result += "*" + std::to_string(end - text) + ";";
        text = end;
    }
    return result + "'";
}

} // namespace

std::string textOf(const char *text)
{
    return text != nullptr ? quoted(text) : "null";
}

std::string textOf(const UChar *text)
{
    return text != nullptr ? quoted(text) : "null";
}

std::string textOf(CxStatus status)
{
    return status.type + std::to_string(status.code);
}

std::string textOf(ZlvStatus status)
{
    return textOf(CxStatus{status.type, status.code}) + " icu " + std::to_string(status.icuError);
}

std::string textOf(const ZlvObjClass *objClass)
{
    if (objClass == nullptr)
        return "null";
    return std::string(objClass->name != nullptr ? objClass->name : "unnamed") +
           (objClass->description != nullptr ? textOf(objClass->description) : "");
}

std::string textOf(const ZlvObject *object)
{
    return object != nullptr ? textOf(object->name) + ":" + textOf(object->objClass) : "null";
}

std::string textOf(const ZlvObjCfg *cfg)
{
    return cfg != nullptr ? textOf(cfg->name) : "null";
}

std::string textOf(const ZlvParm *parm)
{
    if (parm == nullptr)
        return "null";
    const bool isString = parm->type == ZLV_PARM_STRING;
    return std::to_string(parm->type) + ":" +
           (isString ? textOf(parm->value.stringValue) : textOf(parm->value.intValue));
}

std::string textOf(const ZlvI18Msg *message)
{
    if (message == nullptr)
        return "null";
    return "bundle " + textOf(message->bundle) + " key " + textOf(message->key) + " text " +
           textOf(message->text) + " parameters " + textOf(message->parameters) + " locale " +
           textOf(message->locale) + " icu " + textOf(message->icuError);
}

std::string textOf(const ZlvEvent *event)
{
    if (event == nullptr)
        return "null";
    return textOf(event->isMessage) + " level " + textOf(event->level) + " " +
           textOf(event->message);
}

std::string textOf(const CxStringBuff &buff)
{
    return textOf(buff.length) + " of " + textOf(buff.capacity) + " " + textOf(buff.data);
}

std::string textOf(const CxUStringBuff &buff)
{
    return textOf(buff.length) + " of " + textOf(buff.capacity) + " " + textOf(buff.data);
}

std::string textOf(const FileHandlerVars &vars)
{
    return "name " + textOf(vars.fullName) + " directory " + textOf(vars.directory) + " base " +
           textOf(vars.base) + " number " + textOf(vars.number) + " extension " +
           textOf(vars.extension) + " encoding " + textOf(vars.encoding) + " open " +
           textOf(vars.isOpen) + " limit " + textOf(vars.maxBytes) + "*" + textOf(vars.maxFiles) +
           " modes " + textOf(vars.filePermission) + "," + textOf(vars.dirPermission) +
           " appending " + textOf(vars.appending) + " key " + textOf(vars.semKey) + " ready " +
           textOf(vars.semReady);
}

} // namespace zelvo_test

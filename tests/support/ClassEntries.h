// SPDX-License-Identifier: Apache-2.0
// Entries for classes, their registration, and the names of registered classes.
#pragma once

#include <string>
#include <vector>

#include "ZlvObjClass.h"
#include "support/Text.h"

namespace zelvo_test {

/// Entries that a registration may give; never called.
namespace entries {
inline void *allocVars()
{
    return nullptr;
}
inline void freeVars(void *) {}
inline void cfgChange(ZlvObject *, const char *) {}
inline void logEntry(ZlvObject *, ZlvEvent *, va_list) {}
inline void process(ZlvObject *, ZlvEvent *, va_list) {}
inline int32_t isLoggable(ZlvObject *, ZlvEvent *, va_list)
{
    return 1;
}
inline void openEntry(ZlvObject *) {}
inline void closeEntry(ZlvObject *) {}
inline UChar *format(ZlvObject *, ZlvEvent *, va_list)
{
    return nullptr;
}
inline char *header(ZlvObject *)
{
    return nullptr;
}
inline char *trailer(ZlvObject *)
{
    return nullptr;
}
inline UChar *bindMsg(ZlvI18Msg *, va_list)
{
    return nullptr;
}
} // namespace entries

/// Registers a class of each kind, named PREFIX and the kind, with every entry or with none.
inline void addAll(const char *prefix, bool given)
{
    using namespace entries;
    std::string name = prefix;
    auto pick = [given](auto *entry) { return given ? entry : nullptr; };
    ZlvAddLoggerClass((name + "logger").c_str(), nullptr, pick(allocVars), pick(freeVars),
                      pick(cfgChange), pick(logEntry));
    ZlvAddFilterClass((name + "filter").c_str(), nullptr, pick(allocVars), pick(freeVars),
                      pick(cfgChange), pick(process), pick(isLoggable), pick(logEntry));
    ZlvAddHandlerClass((name + "handler").c_str(), nullptr, pick(allocVars), pick(freeVars),
                       pick(cfgChange), pick(process), pick(openEntry), pick(closeEntry));
    ZlvAddUFormatterClass((name + "formatter").c_str(), nullptr, pick(allocVars), pick(freeVars),
                          pick(cfgChange), pick(format), pick(header), pick(trailer),
                          pick(bindMsg));
}

/// The names that an iterator goes through.
inline std::vector<std::string> namesFrom(StringGroupIterator at)
{
    std::vector<std::string> names;
    for (; ZlvStringGroupIterHasNext(at); at = ZlvStringGroupIterNext(at))
        names.push_back(taken(ZlvStringGroupIterGet(at)).value_or("(none)"));
    return names;
}

} // namespace zelvo_test

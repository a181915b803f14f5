// SPDX-License-Identifier: Apache-2.0
/*
 * zelvo_class.hpp - classes of one's own, written as C++ classes. Part of the C++ layer; see
 * zelvo.hpp.
 *
 * A class T is registered under a name with one of the calls below; each object of that name's
 * class then has a T of its own, made when the object is made and destroyed with it. T is any class
 * that can be made without arguments. Its entries are public members, declared noexcept, since no
 * exception may cross the library:
 *
 *     logger     void log(zelvo::Self self, zelvo::Event event) noexcept;
 *     filter     bool accepts(zelvo::Self self, zelvo::Event event) noexcept;
 *     handler    void process(zelvo::Self self, zelvo::Event event) noexcept;
 *                void open(zelvo::Self self) noexcept;               may be missing
 *                void close(zelvo::Self self) noexcept;              may be missing
 *     formatter  zelvo::UString format(zelvo::Self self, zelvo::Event event) noexcept;
 *                zelvo::String header(zelvo::Self self) noexcept;    may be missing
 *                zelvo::String trailer(zelvo::Self self) noexcept;   may be missing
 *     all        bool configure(zelvo::Self self, const char *property) noexcept;  may be missing
 *
 * log() and process() hand the event on with self.passOn(event), to whom it is for them to decide.
 * process() and accepts() are called for enabled objects only. configure() is told the name of a
 * property that has just been set and returns true for one that it knows; the others are those of
 * the kind ("level", "formatterName", "listenerNames" and so on), as all are when it is missing.
 * Nothing in the toolkit calls open(): it is for the class's own process(), and for other classes
 * that know it. close() is called when a handler is let go of; when the toolkit closes, the T's are
 * destroyed first, and close() is not called: what must happen in both cases is the destructor's.
 *
 * Constructor, destructor and entries of a T run with the API mutex held: they make no logging call
 * and no other call that takes the mutex. Nor do they let go of a zelvo::Object: what a T holds it
 * holds as zelvo::InnerObject. The mutex also serialises them, so a T needs no lock of its own. An
 * object whose T could not be made, because memory ran out, behaves as the default of its kind: a
 * logger hands events on, a filter goes by level, a handler does nothing, a formatter writes what
 * the basic one does.
 */
#ifndef ZELVO_CLASS_HPP
#define ZELVO_CLASS_HPP

#include <cstddef>
#include <new>
#include <type_traits>
#include <utility>

#include "ZlvBasicFormatter.h"
#include "ZlvIntl.h"
#include "ZlvLevelFilter.h"
#include "zelvo_entries.hpp"
#include "zelvo_event.hpp"
#include "zelvo_object.hpp"

namespace zelvo {
inline namespace v1 {

/**
 * Registers a class of loggers whose objects each have a T. As with ZlvAddLoggerClass(), the first
 * registration of a name wins, nothing is reported, and closing the toolkit forgets the class.
 *
 * @tparam T           has log()
 * @param name         class name
 * @param description  copied; null for none
 * @lock takes the API mutex
 */
template <class T>
void addLoggerClass(const char *name, const ZlvI18Msg *description = nullptr) noexcept
{
    using Entries = detail::Entries<T>;
    detail::checkState<T>();
    static_assert(detail::LogEntry<T>::fits, "zelvo: a logger class needs a public member "
                                             "void log(zelvo::Self, zelvo::Event) noexcept");
    ZlvAddLoggerClass(name, description, Entries::allocVars, Entries::freeVars,
                      Entries::template cfgChangeOr<ZlvBasicLoggerFCfgChange>(), Entries::log);
}

/**
 * Registers a class of filters whose objects each have a T, under the rules of addLoggerClass().
 *
 * @tparam T           has accepts()
 * @param name         class name
 * @param description  copied; null for none
 * @lock takes the API mutex
 */
template <class T>
void addFilterClass(const char *name, const ZlvI18Msg *description = nullptr) noexcept
{
    using Entries = detail::Entries<T>;
    detail::checkState<T>();
    static_assert(detail::AcceptsEntry<T>::fits,
                  "zelvo: a filter class needs a public member "
                  "bool accepts(zelvo::Self, zelvo::Event) noexcept");
    ZlvAddFilterClass(name, description, Entries::allocVars, Entries::freeVars,
                      Entries::template cfgChangeOr<ZlvLevelFilterFCfgChange>(), nullptr,
                      Entries::isLoggable, nullptr);
}

/**
 * Registers a class of handlers whose objects each have a T, under the rules of addLoggerClass().
 *
 * @tparam T           has process(), and may have open() and close()
 * @param name         class name
 * @param description  copied; null for none
 * @lock takes the API mutex
 */
template <class T>
void addHandlerClass(const char *name, const ZlvI18Msg *description = nullptr) noexcept
{
    using Entries = detail::Entries<T>;
    detail::checkState<T>();
    static_assert(detail::ProcessEntry<T>::fits,
                  "zelvo: a handler class needs a public member "
                  "void process(zelvo::Self, zelvo::Event) noexcept");
    static_assert(detail::OpenEntry<T>::fitsOrIsMissing,
                  "zelvo: open is void open(zelvo::Self) noexcept");
    static_assert(detail::CloseEntry<T>::fitsOrIsMissing,
                  "zelvo: close is void close(zelvo::Self) noexcept");
    ZlvAddHandlerClass(name, description, Entries::allocVars, Entries::freeVars,
                       Entries::template cfgChangeOr<ZlvBasicHandlerFCfgChange>(), Entries::process,
                       Entries::openOrNull(), Entries::closeOrNull());
}

/**
 * Registers a class of formatters whose objects each have a T, under the rules of addLoggerClass().
 *
 * @tparam T           has format(), and may have header() and trailer()
 * @param name         class name
 * @param description  copied; null for none
 * @lock takes the API mutex
 */
template <class T>
void addFormatterClass(const char *name, const ZlvI18Msg *description = nullptr) noexcept
{
    using Entries = detail::Entries<T>;
    detail::checkState<T>();
    static_assert(detail::FormatEntry<T>::fits,
                  "zelvo: a formatter class needs a public member "
                  "zelvo::UString format(zelvo::Self, zelvo::Event) noexcept");
    static_assert(detail::HeaderEntry<T>::fitsOrIsMissing,
                  "zelvo: header is zelvo::String header(zelvo::Self) noexcept");
    static_assert(detail::TrailerEntry<T>::fitsOrIsMissing,
                  "zelvo: trailer is zelvo::String trailer(zelvo::Self) noexcept");
    ZlvAddUFormatterClass(name, description, Entries::allocVars, Entries::freeVars,
                          Entries::template cfgChangeOr<ZlvBasicFormatterFCfgChange>(),
                          Entries::format, Entries::headerOrNull(), Entries::trailerOrNull(),
                          nullptr);
}

/**
 * Calls a function with the T of an object, while no entry of any class runs.
 *
 * @tparam T      the class that the object's class was registered with, in the same program or
 *                library
 * @param object  the object
 * @param use     called with a T &; must not make a call that takes the API mutex
 * @return true if it was called; false for an object of another class or without a T
 * @lock takes the API mutex
 */
template <class T, class Use>
bool withState(const Object &object, Use &&use)
{
    const detail::ApiMutex held;
    T *state = held ? detail::Entries<T>::ofClass(object.get()) : nullptr;
    if (state == nullptr)
        return false;
    std::forward<Use>(use)(*state);
    return true;
}

} // namespace v1
} // namespace zelvo

#endif

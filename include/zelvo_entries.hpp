// SPDX-License-Identifier: Apache-2.0
/*
 * zelvo_entries.hpp - how the entries of a C++ class stand behind the toolkit's tables of
 * functions. Nothing here is for applications; see zelvo_class.hpp.
 */
#ifndef ZELVO_ENTRIES_HPP
#define ZELVO_ENTRIES_HPP

#include <cstddef>
#include <new>
#include <type_traits>

#include "ZlvBasicFormatter.h"
#include "ZlvIntl.h"
#include "ZlvLevelFilter.h"
#include "zelvo_event.hpp"

namespace zelvo {
inline namespace v1 {
namespace detail {

/// Holds the API mutex from construction to destruction, if it could be taken.
class ApiMutex {
public:
    ApiMutex() noexcept : held_(zlvAPIMutexLock() == 1) {}
    ApiMutex(const ApiMutex &) = delete;
    ApiMutex &operator=(const ApiMutex &) = delete;
    ~ApiMutex()
    {
        if (held_)
            zlvAPIMutexUnlock();
    }

    explicit operator bool() const noexcept { return held_; }

private:
    bool held_;
};

template <class Member, class T, class Result, class... Parameters>
inline constexpr bool callsAs = std::is_nothrow_invocable_r_v<Result, Member, T &, Parameters...>;

/// What is known of one entry of a class: whether it has a public member of that name, and whether
/// the toolkit can call it.
#define ZELVO_ENTRY(Entry, member, ...)                                                            \
    template <class T, class = void>                                                               \
    struct Entry {                                                                                 \
        static constexpr bool isThere = false;                                                     \
        static constexpr bool fits = false;                                                        \
        static constexpr bool fitsOrIsMissing = true;                                              \
    };                                                                                             \
    template <class T>                                                                             \
    struct Entry<T, std::void_t<decltype(&T::member)>> {                                           \
        static constexpr bool isThere = true;                                                      \
        static constexpr bool fits = callsAs<decltype(&T::member), T, __VA_ARGS__>;                \
        static constexpr bool fitsOrIsMissing = fits;                                              \
    }

ZELVO_ENTRY(ConfigureEntry, configure, bool, Self, const char *);
ZELVO_ENTRY(LogEntry, log, void, Self, Event);
ZELVO_ENTRY(AcceptsEntry, accepts, bool, Self, Event);
ZELVO_ENTRY(ProcessEntry, process, void, Self, Event);
ZELVO_ENTRY(OpenEntry, open, void, Self);
ZELVO_ENTRY(CloseEntry, close, void, Self);
ZELVO_ENTRY(FormatEntry, format, UString, Self, Event);
ZELVO_ENTRY(HeaderEntry, header, String, Self);
ZELVO_ENTRY(TrailerEntry, trailer, String, Self);

#undef ZELVO_ENTRY

/// What every class of one's own has to be.
template <class T>
constexpr void checkState()
{
    static_assert(std::is_nothrow_default_constructible_v<T>,
                  "zelvo: a class of one's own is made without arguments, by a constructor that is "
                  "noexcept");
    static_assert(alignof(T) <= alignof(std::max_align_t),
                  "zelvo: a class of one's own is stored as malloc() aligns memory");
    static_assert(ConfigureEntry<T>::fitsOrIsMissing,
                  "zelvo: configure is bool configure(zelvo::Self, const char *) noexcept");
}

/// The functions that the toolkit calls for objects whose state is a T.
template <class T>
struct Entries {
    static void *allocVars() noexcept
    {
        void *block = RkoMemoryMalloc(sizeof(T));
        return block != nullptr ? new (block) T() : nullptr;
    }

    static void freeVars(void *vars) noexcept
    {
        if (vars == nullptr)
            return;
        static_cast<T *>(vars)->~T();
        RkoMemoryFree(vars);
    }

    static T *of(ZlvObject *object) noexcept
    {
        return object != nullptr ? static_cast<T *>(object->vars) : nullptr;
    }

    /// The state of any object, if its class was registered with T.
    static T *ofClass(ZlvObject *object) noexcept
    {
        const bool isT = object != nullptr && object->objClass != nullptr &&
                         object->objClass->fAllocVars == &allocVars;
        return isT ? of(object) : nullptr;
    }

    template <ZlvFCfgChange ofKind>
    static void cfgChange(ZlvObject *object, const char *property) noexcept
    {
        T *state = of(object);
        if (state == nullptr || property == nullptr || !state->configure(Self(object), property))
            ofKind(object, property);
    }

    template <ZlvFCfgChange ofKind>
    static constexpr ZlvFCfgChange cfgChangeOr() noexcept
    {
        if constexpr (ConfigureEntry<T>::isThere)
            return cfgChange<ofKind>;
        else
            return ofKind;
    }

    static void log(ZlvObject *logger, ZlvEvent *event, va_list args) noexcept
    {
        T *state = event != nullptr ? of(logger) : nullptr;
        if (state != nullptr)
            state->log(Self(logger), Event(event, args));
        else
            ZlvBasicObjectFLog(logger, event, args);
    }

    static int32_t isLoggable(ZlvObject *filter, ZlvEvent *event, va_list args) noexcept
    {
        T *state = event != nullptr ? of(filter) : nullptr;
        if (state == nullptr)
            return ZlvLevelFilterFIsLoggable(filter, event, args);
        return state->accepts(Self(filter), Event(event, args)) ? 1 : 0;
    }

    static void process(ZlvObject *handler, ZlvEvent *event, va_list args) noexcept
    {
        T *state = event != nullptr ? of(handler) : nullptr;
        if (state != nullptr && zlvIntlIsObjectEnabled(handler) == 1)
            state->process(Self(handler), Event(event, args));
    }

    static void open(ZlvObject *handler) noexcept
    {
        if (T *state = of(handler))
            state->open(Self(handler));
    }

    static void close(ZlvObject *handler) noexcept
    {
        if (T *state = of(handler))
            state->close(Self(handler));
    }

    static UChar *format(ZlvObject *formatter, ZlvEvent *event, va_list args) noexcept
    {
        T *state = event != nullptr ? of(formatter) : nullptr;
        if (state == nullptr)
            return ZlvBasicUFormatterFFormat(formatter, event, args);
        return UString(state->format(Self(formatter), Event(event, args))).release();
    }

    static char *header(ZlvObject *formatter) noexcept
    {
        T *state = of(formatter);
        return state != nullptr ? String(state->header(Self(formatter))).release() : nullptr;
    }

    static char *trailer(ZlvObject *formatter) noexcept
    {
        T *state = of(formatter);
        return state != nullptr ? String(state->trailer(Self(formatter))).release() : nullptr;
    }

    static constexpr ZlvFOpen openOrNull() noexcept
    {
        if constexpr (OpenEntry<T>::isThere)
            return open;
        else
            return nullptr;
    }

    static constexpr ZlvFClose closeOrNull() noexcept
    {
        if constexpr (CloseEntry<T>::isThere)
            return close;
        else
            return nullptr;
    }

    static constexpr ZlvFGetHeader headerOrNull() noexcept
    {
        if constexpr (HeaderEntry<T>::isThere)
            return header;
        else
            return nullptr;
    }

    static constexpr ZlvFGetTrailer trailerOrNull() noexcept
    {
        if constexpr (TrailerEntry<T>::isThere)
            return trailer;
        else
            return nullptr;
    }
};

} // namespace detail
} // namespace v1
} // namespace zelvo

#endif

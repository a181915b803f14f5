// SPDX-License-Identifier: Apache-2.0
/*
 * zelvo_logger.hpp - the logging calls in C++. Part of the C++ layer; see zelvo.hpp.
 */
#ifndef ZELVO_LOGGER_HPP
#define ZELVO_LOGGER_HPP

#include "ZlvLoggable.h"
#include "ZlvLogger.h"
#include "zelvo_arguments.hpp"
#include "zelvo_object.hpp"
#include "zelvo_pattern.hpp"

namespace zelvo {
inline namespace v1 {

/**
 * Holds a logger. The logging calls are those of ZlvLogger.h, with arguments that are checked when
 * they are compiled (zelvo_arguments.hpp says which there are).
 *
 * A call that the logger refuses costs ZlvIsLoggableInline(). What stands between its parentheses
 * is evaluated before, as in any call of a function, but nothing is copied, converted or called: a
 * costly argument is written as a lambda, which only a call that is taken calls. (The macros of
 * ZlvLogMacros.h do not evaluate their arguments either way, and do not check them.)
 *
 * @lock takes the API mutex, if the logger takes the level; an empty handle refuses every call
 */
class Logger : public Object {
public:
    /** Holds nothing. */
    Logger() noexcept = default;

    /**
     * Gets the logger of that name, or creates it, as ZlvGetObject() does.
     *
     * @param name       object name; null gives none
     * @param className  class name; null for whatever class the object or its configuration has
     * @lock takes the API mutex
     */
    explicit Logger(const char *name, const char *className = nullptr) noexcept
        : Logger(Object(name, className))
    {
    }

    /**
     * Takes over a handle.
     *
     * @param object  a handle of an object of another kind gives none
     * @lock takes the API mutex to give such an object back, else none
     */
    explicit Logger(Object object) noexcept
        : Object(detail::ofKind(std::move(object), ZLV_KIND_LOGGER))
    {
    }

    /**
     * Tells whether this logger would take an event of a level.
     *
     * @param level  the event's level
     * @return true if it would
     * @lock none
     */
    bool takes(ZlvLevel level) const noexcept { return ZlvIsLoggableInline(get(), level) != 0; }

    /**
     * Logs a message from a resource bundle at ZLV_LEVEL_FATAL.
     *
     * @param bundle     name or path of the resource bundle
     * @param key        the message's key in the bundle
     * @param arguments  the arguments of the message
     * @return the status that handling the event left; the no-error status for a refusal
     */
    template <class... Args>
    ZlvStatus fatal(const char *bundle, const char *key, const Args &...arguments) const
    {
        return logMessage(ZLV_LEVEL_FATAL, ZlvLogFatal, bundle, key, arguments...);
    }

    /**
     * Logs a message from a resource bundle at ZLV_LEVEL_ERROR.
     *
     * @param bundle     name or path of the resource bundle
     * @param key        the message's key in the bundle
     * @param arguments  the arguments of the message
     * @return the status that handling the event left; the no-error status for a refusal
     */
    template <class... Args>
    ZlvStatus error(const char *bundle, const char *key, const Args &...arguments) const
    {
        return logMessage(ZLV_LEVEL_ERROR, ZlvLogError, bundle, key, arguments...);
    }

    /**
     * Logs a message from a resource bundle at ZLV_LEVEL_WARN.
     *
     * @param bundle     name or path of the resource bundle
     * @param key        the message's key in the bundle
     * @param arguments  the arguments of the message
     * @return the status that handling the event left; the no-error status for a refusal
     */
    template <class... Args>
    ZlvStatus warn(const char *bundle, const char *key, const Args &...arguments) const
    {
        return logMessage(ZLV_LEVEL_WARN, ZlvLogWarn, bundle, key, arguments...);
    }

    /**
     * Logs a message from a resource bundle at ZLV_LEVEL_INFO.
     *
     * @param bundle     name or path of the resource bundle
     * @param key        the message's key in the bundle
     * @param arguments  the arguments of the message
     * @return the status that handling the event left; the no-error status for a refusal
     */
    template <class... Args>
    ZlvStatus info(const char *bundle, const char *key, const Args &...arguments) const
    {
        return logMessage(ZLV_LEVEL_INFO, ZlvLogInfo, bundle, key, arguments...);
    }

    /**
     * Logs a message from a resource bundle without level, which passes every threshold.
     *
     * @param bundle     name or path of the resource bundle
     * @param key        the message's key in the bundle
     * @param arguments  the arguments of the message
     * @return the status that handling the event left; the no-error status for a refusal
     */
    template <class... Args>
    ZlvStatus message(const char *bundle, const char *key, const Args &...arguments) const
    {
        return logMessage(ZLV_LEVEL_NONE, ZlvLogUMsg, bundle, key, arguments...);
    }

    /**
     * Logs a text without level, which passes every threshold.
     *
     * @param pattern    the message pattern
     * @param arguments  the arguments of the pattern
     * @return the status that handling the event left; the no-error status for a refusal
     */
    template <class... Args>
    ZlvStatus text(const Pattern &pattern, const Args &...arguments) const
    {
        if (!takes(ZLV_LEVEL_NONE))
            return refused_;
        return ZlvLogUText(get(), pattern.text(), detail::passed(arguments).raw()...);
    }

    /**
     * Logs a text at ZLV_LEVEL_DEBUG_MIN, with the place of this call in the source.
     *
     * @param pattern    the message pattern
     * @param arguments  the arguments of the pattern
     * @return the status that handling the event left; the no-error status for a refusal
     */
    template <class... Args>
    ZlvStatus debugMin(const PlacedPattern &pattern, const Args &...arguments) const
    {
        return logDebug(ZLV_LEVEL_DEBUG_MIN, ZlvLogDebugMin, pattern, arguments...);
    }

    /**
     * Logs a text at ZLV_LEVEL_DEBUG_MID, with the place of this call in the source.
     *
     * @param pattern    the message pattern
     * @param arguments  the arguments of the pattern
     * @return the status that handling the event left; the no-error status for a refusal
     */
    template <class... Args>
    ZlvStatus debugMid(const PlacedPattern &pattern, const Args &...arguments) const
    {
        return logDebug(ZLV_LEVEL_DEBUG_MID, ZlvLogDebugMid, pattern, arguments...);
    }

    /**
     * Logs a text at ZLV_LEVEL_DEBUG_MAX, with the place of this call in the source.
     *
     * @param pattern    the message pattern
     * @param arguments  the arguments of the pattern
     * @return the status that handling the event left; the no-error status for a refusal
     */
    template <class... Args>
    ZlvStatus debugMax(const PlacedPattern &pattern, const Args &...arguments) const
    {
        return logDebug(ZLV_LEVEL_DEBUG_MAX, ZlvLogDebugMax, pattern, arguments...);
    }

private:
    static constexpr ZlvStatus refused_{CX_STATUS_OK, 0, 0};

    using MessageCall = ZlvStatus (*)(ZlvObject *, const char *, const char *, ...);
    using DebugCall = ZlvStatus (*)(ZlvObject *, const char *, const char *, int32_t, const UChar *,
                                    ...);

    template <class... Args>
    ZlvStatus logMessage(ZlvLevel level, MessageCall call, const char *bundle, const char *key,
                         const Args &...arguments) const
    {
        if (!takes(level))
            return refused_;
        return call(get(), bundle, key, detail::passed(arguments).raw()...);
    }

    template <class... Args>
    ZlvStatus logDebug(ZlvLevel level, DebugCall call, const PlacedPattern &at,
                       const Args &...arguments) const
    {
        if (!takes(level))
            return refused_;
        return call(get(), at.file(), at.function(), at.line(), at.text(),
                    detail::passed(arguments).raw()...);
    }
};

} // namespace v1
} // namespace zelvo

#endif

// SPDX-License-Identifier: Apache-2.0
/*
 * zelvo_event.hpp - what the functions of a class of one's own are given: the object that they
 * belong to, and the event in their hands. Part of the C++ layer; see zelvo.hpp.
 *
 * Both are lent for the length of one entry, which runs with the API mutex held: their members
 * never take it.
 */
#ifndef ZELVO_EVENT_HPP
#define ZELVO_EVENT_HPP

#include <optional>
#include <type_traits>

#include "ZlvIntl.h"
#include "zelvo_handle.hpp"
#include "zelvo_text.hpp"

namespace zelvo {
inline namespace v1 {

/** An argument list as a function's parameter holds it: the list itself, or a pointer to it. */
using ArgumentList = std::decay_t<va_list>;

/**
 * An event, with the arguments of its message.
 *
 * @lock the caller holds the API mutex
 */
class Event {
public:
    /**
     * Takes what an entry is given.
     *
     * @param event      the event; lent
     * @param arguments  the arguments of its message; lent
     */
    Event(ZlvEvent *event, ArgumentList arguments) noexcept : event_(event), arguments_(arguments)
    {
    }

    /**
     * Tells when the event was made.
     *
     * @return whole milliseconds since 1970-01-01 00:00 UTC
     */
    double time() const noexcept { return ZlvGetEventTime(event_); }

    /**
     * Tells the event's level.
     *
     * @return the level; ZLV_LEVEL_NONE for an event without one
     */
    ZlvLevel level() const noexcept { return ZlvGetEventLevel(event_); }

    /**
     * Tells messages from debug and text calls.
     *
     * @return true for a message
     */
    bool isMessage() const noexcept { return ZlvGetEventIsMessage(event_) == 1; }

    /**
     * Binds the message to text, in the locale of the event or of the message.
     *
     * @return the text; none when there is none or it cannot be bound
     */
    UString text() const noexcept
    {
        return UString(ZlvBindEventUMsg(event_, zlvIntlBindUI18Msg, arguments_));
    }

    /**
     * Lends the message, with its bundle, key and pattern.
     *
     * @return the message; null when memory ran out as the event was made
     */
    const ZlvI18Msg *message() const noexcept { return event_->message; }

    /**
     * Copies the identifier of the message.
     *
     * @return the identifier; none while none is set
     */
    String messageId() const noexcept { return String(ZlvGetEventMessageId(event_)); }

    /**
     * Sets the identifier of the message.
     *
     * @param id  copied; null clears it
     */
    void setMessageId(const char *id) const noexcept { ZlvSetEventMessageId(event_, id); }

    /**
     * Sets the locale that the message is bound in, here and by whoever gets the event later.
     *
     * @param locale  locale name; null leaves the message's own
     */
    void setLocale(const char *locale) const noexcept { zlvSetEventLocale(event_, locale); }

    /**
     * Reads a property as text.
     *
     * @param name  property name
     * @return the value; none when there is none
     */
    String property(const char *name) const noexcept
    {
        return String(ZlvGetEventProp(event_, name, nullptr));
    }

    /**
     * Reads a property as bool, int32_t, int64_t, float or double.
     *
     * @param name  property name
     * @return the value; nothing when there is none or it does not convert
     */
    template <class T>
    std::optional<T> property(const char *name) const noexcept
    {
        return detail::read<T>(detail::pick<T>(ZlvGetEventPropBool, ZlvGetEventPropInt,
                                               ZlvGetEventPropLong, ZlvGetEventPropFloat,
                                               ZlvGetEventPropDouble),
                               event_, name);
    }

    /**
     * Sets a property, for whoever gets the event later.
     *
     * @param name   property name
     * @param value  text, copied; null removes the value
     */
    void setProperty(const char *name, const char *value) const noexcept
    {
        ZlvSetEventProp(event_, name, value);
    }

    /**
     * Sets a property to a bool, an int32_t, a float or a double.
     *
     * @param name   property name
     * @param value  stored as ZlvSetEventPropBool() and its like do
     */
    template <class T, class = std::enable_if_t<!std::is_null_pointer_v<T>>>
    void setProperty(const char *name, T value) const noexcept
    {
        detail::set(detail::pickSetter<T>(ZlvSetEventPropBool, ZlvSetEventPropInt,
                                          ZlvSetEventPropFloat, ZlvSetEventPropDouble),
                    event_, name, value);
    }

    /**
     * Reports a failure to the caller of the logging call, whose ZlvStatus shows the last one.
     *
     * @param status  the failure
     */
    void fail(CxStatus status) const noexcept { event_->status = status; }

    /**
     * Lends the record for C calls.
     *
     * @return the event
     */
    ZlvEvent *get() const noexcept { return event_; }

    /**
     * Lends the arguments for C calls, which copy the list and never advance it.
     *
     * @return the list
     */
    ArgumentList arguments() const noexcept { return arguments_; }

private:
    ZlvEvent *event_;
    ArgumentList arguments_;
};

/**
 * Holds a reference to an object as entries and the state of a class do. A zelvo::Object takes the
 * API mutex to let go, so in either it would wait for itself for ever.
 */
using InnerObject = Handle<ZlvObject, zlvIntlAcquireObject, zlvIntlReleaseObject>;

/**
 * The object that an entry runs for.
 *
 * @lock the caller holds the API mutex
 */
class Self {
public:
    /**
     * Takes what an entry is given.
     *
     * @param object  the object; lent
     */
    explicit Self(ZlvObject *object) noexcept : object_(object) {}

    /**
     * Lends the object's name.
     *
     * @return the name
     */
    const char *name() const noexcept { return object_->name; }

    /**
     * Reads a property as text.
     *
     * @param name  property name
     * @return the value; none when there is none
     */
    String property(const char *name) const noexcept
    {
        return String(zlvIntlGetObjProp(object_, name, nullptr));
    }

    /**
     * Reads a property as bool, int32_t, int64_t, float or double.
     *
     * @param name  property name
     * @return the value; nothing when there is none or it does not convert
     */
    template <class T>
    std::optional<T> property(const char *name) const noexcept
    {
        return detail::read<T>(detail::pick<T>(zlvIntlGetObjPropBool, zlvIntlGetObjPropInt,
                                               zlvIntlGetObjPropLong, zlvIntlGetObjPropFloat,
                                               zlvIntlGetObjPropDouble),
                               object_, name);
    }

    /**
     * Gets the object of a name, or creates it.
     *
     * @param name       object name; null gives none
     * @param className  class name; null for whatever class the object or its configuration has
     * @return a handle that the state of a class may keep; empty when there is no such object
     */
    InnerObject object(const char *name, const char *className = nullptr) const noexcept
    {
        return InnerObject(zlvIntlGetObject(name, className));
    }

    /**
     * Hands an event on to the listeners of this logger, filter or handler.
     *
     * @param event  the event
     */
    void passOn(const Event &event) const noexcept
    {
        ZlvBasicObjectFLog(object_, event.get(), event.arguments());
    }

    /**
     * Has the formatter of this handler make an event's record.
     *
     * @param event  the event
     * @return the record; none when there is no formatter or it gave none
     */
    UString format(const Event &event) const noexcept
    {
        return UString(zlvIntlUHandlerDoFmt(object_, event.get(), event.arguments()));
    }

    /**
     * Asks the formatter of this handler for what opens an output.
     *
     * @return the header; none when there is none
     */
    String header() const noexcept { return String(zlvIntlHandlerGetFmtHeader(object_)); }

    /**
     * Asks the formatter of this handler for what closes an output.
     *
     * @return the trailer; none when there is none
     */
    String trailer() const noexcept { return String(zlvIntlHandlerGetFmtTrailer(object_)); }

    /**
     * Lends the object for C calls.
     *
     * @return the object
     */
    ZlvObject *get() const noexcept { return object_; }

private:
    ZlvObject *object_;
};

} // namespace v1
} // namespace zelvo

#endif

/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvEvent.h - the record that one logging call builds and hands down the tree of listeners. Its
 * calls take no lock: they serve class functions, which run while the logging call holds the API
 * mutex. An event belongs to its logging call; listeners never keep it.
 */
#ifndef ZLV_EVENT_H
#define ZLV_EVENT_H

#include "ZlvLevel.h"
#include "ZlvObjClass.h"
#include "ZlvTypes.h"

CX_BEGIN_DECLS

/** What went wrong while an event was handled; {'-', 0} as long as nothing has. */
typedef CxStatus ZlvEventStatus;

/** The record of one logging call. Class functions read the fields; applications use the calls. */
struct ZlvEvent {
    ZlvBool isMessage;  /**< 1 for a bundle/key message, 0 for debug and text calls */
    double time;        /**< creation, whole milliseconds since 1970-01-01 00:00 UTC */
    ZlvLevel level;     /**< ZLV_LEVEL_NONE for an event without level */
    ZlvI18Msg *message; /**< owned; null if memory ran out when the event was made */
    char *messageId;    /**< owned; null until set */
    const char *locale; /**< interned, never freed; the locale to bind in, null until set */
    StringToStringMap *properties; /**< owned; null until the first property is set */
    ZlvEventStatus status;         /**< a handler stores its failure here */
};

/**
 * Makes an event with the present time. The argument list is not kept: it travels beside the event
 * to whoever binds the message.
 *
 * @param level   the event's level
 * @param bundle  resource bundle of the message, copied; null for an inline message. The event's
 *                is-message flag starts as 1 exactly if this is given
 * @param key     key of the message in the bundle, copied; may be null
 * @param text    inline message pattern, copied; may be null
 * @param args    the message's arguments, not read; may be null
 * @return the event, which the caller frees with ZlvFreeEvent(); null when memory ran out
 * @lock none
 */
ZLV_API ZlvEvent *ZlvVaAllocUEvent(ZlvLevel level, const char *bundle, const char *key,
                                   const UChar *text, va_list args);

/**
 * Frees an event with its message, message identifier and properties.
 *
 * @param event  the event; null is ignored
 * @lock none
 */
ZLV_API void ZlvFreeEvent(ZlvEvent *event);

/**
 * Gives the time at which an event was made.
 *
 * @param event  the event; null gives 0.0
 * @return whole milliseconds since 1970-01-01 00:00 UTC
 * @lock none
 */
ZLV_API double ZlvGetEventTime(const ZlvEvent *event);

/**
 * Gives the level of an event.
 *
 * @param event  the event; null gives ZLV_LEVEL_NONE
 * @return the level; ZLV_LEVEL_NONE for an event without one
 * @lock none
 */
ZLV_API ZlvLevel ZlvGetEventLevel(const ZlvEvent *event);

/**
 * Turns an event's message into text. If the event has a locale, it becomes the message's locale
 * first, for this bind and all later ones.
 *
 * @param event  the event; null gives null
 * @param bind   the bind function, called with the event's message (which may be null) and the
 *               list; null gives null
 * @param args   the message's arguments, handed on as they are
 * @return the bind function's result, which the caller frees with RkoMemoryFree(); may be null
 * @lock the caller holds the API mutex
 */
ZLV_API UChar *ZlvBindEventUMsg(ZlvEvent *event, ZlvFBindMsg bind, va_list args);

/**
 * Gives the identifier of an event's message.
 *
 * @param event  the event; null gives null
 * @return a copy, which the caller frees with RkoMemoryFree(); null while none is set
 * @lock none
 */
ZLV_API char *ZlvGetEventMessageId(const ZlvEvent *event);

/**
 * Sets the identifier of an event's message, in place of the former one.
 *
 * @param event  the event; null is ignored
 * @param id     the identifier, copied; null clears it
 * @lock none
 */
ZLV_API void ZlvSetEventMessageId(ZlvEvent *event, const char *id);

/**
 * Tells whether an event carries a message rather than debug or plain text.
 *
 * @param event  the event; null gives 0
 * @return the flag as it was set last
 * @lock none
 */
ZLV_API ZlvBool ZlvGetEventIsMessage(const ZlvEvent *event);

/**
 * Marks an event as carrying a message or not.
 *
 * @param event      the event; null is ignored
 * @param isMessage  the flag, stored as it is
 * @lock none
 */
ZLV_API void ZlvSetEventIsMessage(ZlvEvent *event, ZlvBool isMessage);

/**
 * Reads a property as text.
 *
 * @param event     the event; null has no properties
 * @param property  the property's name; null is not found
 * @param found     set to 1 if the property is there, else to 0; may be null
 * @return a copy, which the caller frees with RkoMemoryFree(); null when not found
 * @lock none
 */
ZLV_API char *ZlvGetEventProp(const ZlvEvent *event, const char *property, ZlvBool *found);

/**
 * Reads a property as a truth value; see ZlvGetMapPropBool() for what converts.
 *
 * @param event     the event; null has no properties
 * @param property  the property's name; null is not found
 * @param found     set to 1 if the property is there and converts, else to 0; may be null
 * @return the value; 0 when not found
 * @lock none
 */
ZLV_API ZlvBool ZlvGetEventPropBool(const ZlvEvent *event, const char *property, ZlvBool *found);

/**
 * Reads a property as a 32-bit number; see ZlvGetMapPropInt() for what converts.
 *
 * @param event     the event; null has no properties
 * @param property  the property's name; null is not found
 * @param found     set to 1 if the property is there and converts, else to 0; may be null
 * @return the value; 0 when not found
 * @lock none
 */
ZLV_API int32_t ZlvGetEventPropInt(const ZlvEvent *event, const char *property, ZlvBool *found);

/**
 * Reads a property as a 64-bit number; see ZlvGetMapPropLong() for what converts.
 *
 * @param event     the event; null has no properties
 * @param property  the property's name; null is not found
 * @param found     set to 1 if the property is there and converts, else to 0; may be null
 * @return the value; 0 when not found
 * @lock none
 */
ZLV_API int64_t ZlvGetEventPropLong(const ZlvEvent *event, const char *property, ZlvBool *found);

/**
 * Reads a property as a single-precision number; see ZlvGetMapPropFloat() for what converts.
 *
 * @param event     the event; null has no properties
 * @param property  the property's name; null is not found
 * @param found     set to 1 if the property is there and converts, else to 0; may be null
 * @return the value; 0 when not found
 * @lock none
 */
ZLV_API float ZlvGetEventPropFloat(const ZlvEvent *event, const char *property, ZlvBool *found);

/**
 * Reads a property as a double-precision number; see ZlvGetMapPropDouble() for what converts.
 *
 * @param event     the event; null has no properties
 * @param property  the property's name; null is not found
 * @param found     set to 1 if the property is there and converts, else to 0; may be null
 * @return the value; 0 when not found
 * @lock none
 */
ZLV_API double ZlvGetEventPropDouble(const ZlvEvent *event, const char *property, ZlvBool *found);

/**
 * Sets a property to a text.
 *
 * @param event     the event; null is ignored
 * @param property  the property's name; null is ignored
 * @param value     the text, copied; null stores no text, so that the property counts as not found
 * @return 1 if the property was set, else 0
 * @lock none
 */
ZLV_API ZlvBool ZlvSetEventProp(ZlvEvent *event, const char *property, const char *value);

/**
 * Sets a property to "true" if the value is exactly 1, else to "false".
 *
 * @param event     the event; null is ignored
 * @param property  the property's name; null is ignored
 * @param value     the value
 * @lock none
 */
ZLV_API void ZlvSetEventPropBool(ZlvEvent *event, const char *property, ZlvBool value);

/**
 * Sets a property to a 32-bit number, stored as text.
 *
 * @param event     the event; null is ignored
 * @param property  the property's name; null is ignored
 * @param value     the value
 * @lock none
 */
ZLV_API void ZlvSetEventPropInt(ZlvEvent *event, const char *property, int32_t value);

/**
 * Sets a property to a number that ZlvGetEventPropLong() reads back, stored as text.
 *
 * @param event     the event; null is ignored
 * @param property  the property's name; null is ignored
 * @param value     the value
 * @lock none
 */
ZLV_API void ZlvSetEventPropLong(ZlvEvent *event, const char *property, int32_t value);

/**
 * Sets a property to a single-precision number, stored as text.
 *
 * @param event     the event; null is ignored
 * @param property  the property's name; null is ignored
 * @param value     the value
 * @lock none
 */
ZLV_API void ZlvSetEventPropFloat(ZlvEvent *event, const char *property, float value);

/**
 * Sets a property to a double-precision number, stored as text.
 *
 * @param event     the event; null is ignored
 * @param property  the property's name; null is ignored
 * @param value     the value
 * @lock none
 */
ZLV_API void ZlvSetEventPropDouble(ZlvEvent *event, const char *property, double value);

CX_END_DECLS

#endif

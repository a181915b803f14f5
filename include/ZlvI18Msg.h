/* SPDX-License-Identifier: Apache-2.0 */
/* ZlvI18Msg.h - a message that becomes text late: when a formatter binds it, in its locale. */
#ifndef ZLV_I18_MSG_H
#define ZLV_I18_MSG_H

#include "ZlvTypes.h"

CX_BEGIN_DECLS

/**
 * A key into a resource bundle, or a pattern given inline. Class authors read the fields with the
 * API mutex held; applications go through the calls.
 */
struct ZlvI18Msg {
    char *bundle; /**< owned; name or path of a resource bundle, null for an inline pattern */
    char *key;    /**< owned; the pattern's key in the bundle */
    UChar *text;  /**< owned; the inline pattern, used only when bundle is null */
    ParmList *parameters; /**< owned; made on first request, copied along, not used by the bind */
    const char *locale;   /**< interned, never freed; null stands for the default locale */
    int32_t icuError;     /**< UErrorCode of the last bind step that failed, 0 if none has */
};

/**
 * Makes a message from copies of its parts.
 *
 * @param bundle  name or path of a resource bundle; null for an inline message
 * @param key     the pattern's key in the bundle; may be null
 * @param text    inline pattern, UTF-16, used only when bundle is null; may be null
 * @return the message, which the caller frees with ZlvFreeI18Msg(); null when memory ran out or
 *         the lock failed
 * @lock takes the API mutex
 */
ZLV_API ZlvI18Msg *ZlvAllocUI18Msg(const char *bundle, const char *key, const UChar *text);

/**
 * Makes a copy of a message: bundle, key, text and parameters are copied, locale and ICU error
 * taken over as they are.
 *
 * @param message  the message to copy; null gives null
 * @return the copy, which the caller frees with ZlvFreeI18Msg(); null when memory ran out or the
 *         lock failed
 * @lock takes the API mutex
 */
ZLV_API ZlvI18Msg *ZlvCopyI18Msg(const ZlvI18Msg *message);

/**
 * Frees a message and all that it owns.
 *
 * @param message  the message; null is ignored
 * @lock takes the API mutex
 */
ZLV_API void ZlvFreeI18Msg(ZlvI18Msg *message);

/**
 * Turns a message into text: its pattern, from the bundle or inline, formatted in the message's
 * locale with ICU's message syntax. A bundle that cannot be opened under its full name is tried
 * again under what follows the last '/', so a path falls back to ICU's own data path. A failed
 * bundle, key or format leaves its UErrorCode in the message's ICU error; a later success does not
 * clear it. A pattern that ICU refuses before it has formatted anything, and one that yields the
 * empty text, give null and leave the ICU error alone.
 *
 * The types of the arguments follow from the pattern: `{n}` takes a const UChar *, `{n,number}` a
 * double, `{n,number,integer}` an int32_t, `{n,date}` and `{n,time}` a UDate.
 *
 * @param message  the message; null gives null
 * @param args     the pattern's arguments in order; the list is only copied, never advanced, and
 *                 not touched at all for a pattern without '{'. Where a null list can be expressed
 *                 it stands for zeros: ICU refuses a pattern that asks it for a text, and one with
 *                 an argument number above 63 fails with U_ILLEGAL_ARGUMENT_ERROR
 * @return the text, which the caller frees with RkoMemoryFree(); null when there is none
 * @lock takes the API mutex
 */
ZLV_API UChar *ZlvBindUI18Msg(ZlvI18Msg *message, va_list args);

CX_END_DECLS

#endif

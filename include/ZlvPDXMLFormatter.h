/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvPDXMLFormatter.h - the class functions of "zlv_xmlformatter", which renders an event as a
 * Message or a Trace element, and the pieces of such an element, for authors of classes. Class
 * functions run with the API mutex held. Nothing is escaped, neither in attributes nor in CDATA.
 */
#ifndef ZLV_PD_XML_FORMATTER_H
#define ZLV_PD_XML_FORMATTER_H

#include "CxUStringBuff.h"
#include "ZlvLevel.h"
#include "ZlvTypes.h"

CX_BEGIN_DECLS

/** The variables of an XML formatter, each 0 or 1; read and written with the API mutex held. */
typedef struct PDXMLFormatterVars {
    uint8_t emitSingleItems; /**< the next record is preceded by the single items; 1 at first */
    uint8_t singleComponent; /**< "singleComponent": the component is written once */
    uint8_t singleProduct;   /**< "singleProduct": the product is written once */
    uint8_t singleProductId; /**< "singleProductId": the product instance is written once */
    uint8_t singleServer;    /**< "singleServer": the server is written once */
    uint8_t forceAsMessage;  /**< "forceAsMessage": every event is written as a Message */
    uint8_t forceAsTrace;    /**< "forceAsTrace": every event is written as a Trace */
} PDXMLFormatterVars;

/**
 * Makes the variables of an XML formatter: the single items are due, all else is off.
 *
 * @return PDXMLFormatterVars, which the toolkit frees with ZlvPDXMLFormatterFFreeVars(); null when
 *         memory ran out
 * @lock the caller holds the API mutex
 */
ZLV_API void *ZlvPDXMLFormatterFAllocVars(void);

/**
 * Frees the variables of an XML formatter.
 *
 * @param vars  what ZlvPDXMLFormatterFAllocVars() gave; null is ignored
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvPDXMLFormatterFFreeVars(void *vars);

/**
 * Takes over a changed property. The six names of PDXMLFormatterVars are read as truth values, 0
 * when the property is absent or neither "true" nor "false"; every other name goes to
 * ZlvBasicFormatterFCfgChange().
 *
 * @param formatter     the formatter; null does nothing. One without variables ignores the six
 * @param propertyName  the property that has changed; null does nothing
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvPDXMLFormatterFCfgChange(ZlvObject *formatter, const char *propertyName);

/**
 * Renders an event as one element: a Message or a Trace, as the event says unless exactly one of
 * the force flags is set. If single items are due, they are written before the element, and then
 * are due no more until the next header. If the formatter has a locale, it becomes the event's
 * before the message is bound.
 *
 * @param formatter  the formatter; null or one without variables gives null
 * @param event      the event; null gives null
 * @param args       the message's arguments; copied by each reader, never advanced
 * @return the record, which the caller frees with RkoMemoryFree(); null when there is none
 * @lock the caller holds the API mutex
 */
ZLV_API UChar *ZlvPDXMLUFormatterFFormat(ZlvObject *formatter, ZlvEvent *event, va_list args);

/**
 * Notes that a file begins: the next record is preceded by the single items. There is no header
 * text.
 *
 * @param formatter  the formatter; null or one without variables is ignored
 * @return always null
 * @lock the caller holds the API mutex
 */
ZLV_API char *ZlvPDXMLFormatterFGetHeader(ZlvObject *formatter);

/**
 * Gives the trailer of a formatter that has none.
 *
 * @param formatter  ignored; may be null
 * @return always null
 * @lock the caller holds the API mutex
 */
ZLV_API char *ZlvPDXMLFormatterFGetTrailer(ZlvObject *formatter);

/**
 * Sees to it that an event carries its message's identifier. If it has none, not even an empty one,
 * its message is bound, and the identifier that CxParseKvtID() finds at the start of the text is
 * stored in the event, or "" when there is none.
 *
 * @param formatter  not used; may be null
 * @param event      the event; null does nothing
 * @param args       the message's arguments; copied by each reader, never advanced
 * @lock the caller holds the API mutex
 */
ZLV_API void zlvPDXMLUFormatterCacheMessageID(ZlvObject *formatter, ZlvEvent *event, va_list args);

/**
 * Tells whether a property of an event is written as an attribute of the record. Those that have
 * an element of their own are not: "threadId", "correlationId", "client", "zlv_prop_srcfile",
 * "zlv_prop_srcline", "zlv_prop_srcfunction", "server", "serverFormat", "product", "component",
 * "productInstance", "processId".
 *
 * @param key  the property's name, compared exactly; null gives 0
 * @return 1 if it is written, else 0
 * @lock none
 */
ZLV_API ZlvBool zlvPDXMLCheckKey(const char *key);

/**
 * Appends the word of a level: MAX, MID, MIN, INFO, WARN, ERROR (for fatal too) or OTHER.
 *
 * @param buff   the record; null is ignored
 * @param level  the level
 * @lock none
 */
ZLV_API void zlvPDXMLEmitULevel(CxUStringBuff *buff, ZlvLevel level);

/**
 * Appends those of the elements Server, ProductId, Component and ProductInstance, in this order,
 * that are asked for and that the event has as properties.
 *
 * @param buff             the record; null is ignored
 * @param event            the event; null has no properties
 * @param server           not 0 to append "server", with "serverFormat" as its attribute
 * @param product          not 0 to append "product"
 * @param component        not 0 to append "component"
 * @param productInstance  not 0 to append "productInstance"
 * @lock none
 */
ZLV_API void zlvPDXMLEmitUProductInfo(CxUStringBuff *buff, const ZlvEvent *event, ZlvBool server,
                                      ZlvBool product, ZlvBool component, ZlvBool productInstance);

/**
 * Appends the Source element, if the event has a source file: the file and, if the event has them,
 * function and line.
 *
 * @param buff   the record; null is ignored
 * @param event  the event; null has no properties
 * @return 1 if there is a source file, else 0
 * @lock none
 */
ZLV_API ZlvBool zlvPDXMLEmitUSource(CxUStringBuff *buff, const ZlvEvent *event);

/**
 * Appends the TranslationInfo element, if the event's message has a bundle and a key: their names
 * and, if the key's pattern can be had in the message's locale, the arguments {0} to {9}, up to the
 * first that the pattern does not have or that is neither a text, a number nor a choice. An
 * argument is read only if ICU reads it with the same type when it binds the message.
 *
 * @param buff   the record; null is ignored
 * @param event  the event; null has no message
 * @param args   the message's arguments, copied before they are read; a null list stands for
 *               zeros and for texts that show nothing
 * @lock the caller holds the API mutex
 */
ZLV_API void zlvPDXMLEmitUTranslationInfo(CxUStringBuff *buff, const ZlvEvent *event, va_list args);

CX_END_DECLS

#endif

/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvProps.h - typed access to properties, which are stored as text in a map from string to string.
 *
 * These calls take no lock: whoever shares the map holds the API mutex. A getter whose property is
 * absent, is stored as null or does not convert gives 0 or null and clears its found flag; the flag
 * tells such a result from a stored 0.
 */
#ifndef ZLV_PROPS_H
#define ZLV_PROPS_H

#include "ZlvStringToStringMap.h"
#include "ZlvTypes.h"

CX_BEGIN_DECLS

/**
 * Reads a property as text.
 *
 * @param map       null has no properties
 * @param property  name, compared exactly; null gives null
 * @param found     receives 1 when there is a text, else 0; may be null
 * @return a copy, which the caller frees with RkoMemoryFree(); null when not found
 * @lock none
 */
ZLV_API char *ZlvGetMapProp(StringToStringMap *map, const char *property, ZlvBool *found);

/**
 * Reads a property as a truth value: "true" or "false" in any case of letters.
 *
 * @param map       null has no properties
 * @param property  name, compared exactly; null gives 0
 * @param found     receives 1 when the text converts, else 0; may be null
 * @return 1 for "true", else 0
 * @lock none
 */
ZLV_API ZlvBool ZlvGetMapPropBool(StringToStringMap *map, const char *property, ZlvBool *found);

/**
 * Reads the first byte of a property.
 *
 * @param map       null has no properties
 * @param property  name, compared exactly; null gives 0
 * @param found     receives 1 when there is a text, be it empty, else 0; may be null
 * @return the byte; 0 for the empty text and when not found
 * @lock none
 */
ZLV_API char ZlvGetMapPropChar(StringToStringMap *map, const char *property, ZlvBool *found);

/**
 * Reads a property as a decimal number. Leading blanks and what follows the number are ignored. A
 * number beyond 32 bits gives its low 32 bits; one beyond 64 bits is first brought to the nearest
 * 64-bit number, so it gives -1 when positive and 0 when negative.
 *
 * @param map       null has no properties
 * @param property  name, compared exactly; null gives 0
 * @param found     receives 1 when the text begins with a number, else 0; may be null
 * @return the number; 0 when not found
 * @lock none
 */
ZLV_API int32_t ZlvGetMapPropInt(StringToStringMap *map, const char *property, ZlvBool *found);

/**
 * Reads a property as a decimal number of 64 bits. Leading blanks and what follows the number are
 * ignored. A number beyond 64 bits gives the nearest one within.
 *
 * @param map       null has no properties
 * @param property  name, compared exactly; null gives 0
 * @param found     receives 1 when the text begins with a number, else 0; may be null
 * @return the number; 0 when not found
 * @lock none
 */
ZLV_API int64_t ZlvGetMapPropLong(StringToStringMap *map, const char *property, ZlvBool *found);

/**
 * Reads a property as a floating number, as sscanf() does with "%f". Leading blanks and what
 * follows the number are ignored; a number too large gives an infinity.
 *
 * @param map       null has no properties
 * @param property  name, compared exactly; null gives 0
 * @param found     receives 1 when the text begins with a number, else 0; may be null
 * @return the number; 0 when not found
 * @lock none
 */
ZLV_API float ZlvGetMapPropFloat(StringToStringMap *map, const char *property, ZlvBool *found);

/**
 * Reads a property as a floating number of double precision, as sscanf() does with "%lf". Leading
 * blanks and what follows the number are ignored; a number too large gives an infinity.
 *
 * @param map       null has no properties
 * @param property  name, compared exactly; null gives 0
 * @param found     receives 1 when the text begins with a number, else 0; may be null
 * @return the number; 0 when not found
 * @lock none
 */
ZLV_API double ZlvGetMapPropDouble(StringToStringMap *map, const char *property, ZlvBool *found);

/**
 * Stores a text.
 *
 * @param map       null stores nothing
 * @param property  name, copied; null stores nothing
 * @param value     copied; null is stored as null, and the getters then do not find the property
 * @return 1 when stored, else 0
 * @lock none
 */
ZLV_API ZlvBool ZlvSetMapProp(StringToStringMap *map, const char *property, const char *value);

/**
 * Stores "true" or "false".
 *
 * @param map       null stores nothing
 * @param property  name, copied; null stores nothing
 * @param value     1 for "true"; any other value is "false"
 * @lock none
 */
ZLV_API void ZlvSetMapPropBool(StringToStringMap *map, const char *property, uint8_t value);

/**
 * Stores a text of one character. When memory runs out nothing is stored.
 *
 * @param map       null stores nothing
 * @param property  name, copied; null stores nothing
 * @param value     the character; 0 stores the empty text
 * @lock none
 */
ZLV_API void ZlvSetMapPropChar(StringToStringMap *map, const char *property, char value);

/**
 * Stores a number in decimal. When memory runs out nothing is stored.
 *
 * @param map       null stores nothing
 * @param property  name, copied; null stores nothing
 * @param value     the number
 * @lock none
 */
ZLV_API void ZlvSetMapPropInt(StringToStringMap *map, const char *property, int32_t value);

/**
 * Stores the low 32 bits of a number, as a signed number in decimal: larger numbers are cut. When
 * memory runs out nothing is stored.
 *
 * @param map       null stores nothing
 * @param property  name, copied; null stores nothing
 * @param value     the number
 * @lock none
 */
ZLV_API void ZlvSetMapPropLong(StringToStringMap *map, const char *property, int64_t value);

/**
 * Stores a number in decimal with six digits of fraction. When memory runs out nothing is stored.
 *
 * @param map       null stores nothing
 * @param property  name, copied; null stores nothing
 * @param value     the number
 * @lock none
 */
ZLV_API void ZlvSetMapPropFloat(StringToStringMap *map, const char *property, float value);

/**
 * Stores a number in decimal with six digits of fraction. When memory runs out nothing is stored.
 *
 * @param map       null stores nothing
 * @param property  name, copied; null stores nothing
 * @param value     the number
 * @lock none
 */
ZLV_API void ZlvSetMapPropDouble(StringToStringMap *map, const char *property, double value);

CX_END_DECLS

#endif

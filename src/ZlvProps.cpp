// SPDX-License-Identifier: Apache-2.0
// Typed access to properties, and the conversions from their text.
#include "ZlvProps.h"

#include <cstdio>
#include <cstdlib>

#include "CxString.h"
#include "CxUString.h"
#include "ZlvParm.h"
#include "ZlvPropsIntl.h"
#include "util/CxOwned.h"

using zelvo::OwnedStr;

namespace {

void tell(ZlvBool *found, bool isFound)
{
    if (found != nullptr)
        *found = isFound;
}

template <class Value>
Value scan(const char *text, const char *format, ZlvBool *found)
{
    Value value = 0;
    // NOLINTNEXTLINE(cert-err34-c): an overflow is an infinity, which is the result wanted.
    const bool isNumber = text != nullptr && std::sscanf(text, format, &value) == 1;
    tell(found, isNumber);
    return isNumber ? value : 0;
}

template <class Value>
Value getConverted(StringToStringMap *map, const char *property, ZlvBool *found,
                   Value (*convert)(const char *, ZlvBool *))
{
    OwnedStr text{zlvIntlStringToStringMapGet(map, property)};
    return convert(text.get(), found);
}

void setRendered(StringToStringMap *map, const char *property, const ZlvParm &value)
{
    OwnedStr text{CxUStringParmToStr(&value)};
    if (text)
        ZlvSetMapProp(map, property, text.get());
}

} // namespace

ZlvBool zlvPropStrToBool(const char *text, ZlvBool *found)
{
    const bool isTrue = RkoStringICmp(text, "true") == 0;
    tell(found, isTrue || RkoStringICmp(text, "false") == 0);
    return isTrue;
}

char zlvPropStrToChar(const char *text, ZlvBool *found)
{
    tell(found, text != nullptr);
    return text == nullptr ? '\0' : *text;
}

int32_t zlvPropStrToInt32(const char *text, ZlvBool *found)
{
    return static_cast<int32_t>(zlvPropStrToInt64(text, found));
}

/// strtoll() reads what sscanf() reads with "%lld", and says what an overflow gives.
int64_t zlvPropStrToInt64(const char *text, ZlvBool *found)
{
    char *end = nullptr;
    const int64_t number = text == nullptr ? 0 : std::strtoll(text, &end, 10);
    tell(found, end != text);
    return number;
}

float zlvPropStrToFloat32(const char *text, ZlvBool *found)
{
    return scan<float>(text, "%f", found);
}

double zlvPropStrToFloat64(const char *text, ZlvBool *found)
{
    return scan<double>(text, "%lf", found);
}

char *ZlvGetMapProp(StringToStringMap *map, const char *property, ZlvBool *found)
{
    char *value = zlvIntlStringToStringMapGet(map, property);
    tell(found, value != nullptr);
    return value;
}

ZlvBool ZlvGetMapPropBool(StringToStringMap *map, const char *property, ZlvBool *found)
{
    return getConverted(map, property, found, zlvPropStrToBool);
}

char ZlvGetMapPropChar(StringToStringMap *map, const char *property, ZlvBool *found)
{
    return getConverted(map, property, found, zlvPropStrToChar);
}

int32_t ZlvGetMapPropInt(StringToStringMap *map, const char *property, ZlvBool *found)
{
    return getConverted(map, property, found, zlvPropStrToInt32);
}

int64_t ZlvGetMapPropLong(StringToStringMap *map, const char *property, ZlvBool *found)
{
    return getConverted(map, property, found, zlvPropStrToInt64);
}

float ZlvGetMapPropFloat(StringToStringMap *map, const char *property, ZlvBool *found)
{
    return getConverted(map, property, found, zlvPropStrToFloat32);
}

double ZlvGetMapPropDouble(StringToStringMap *map, const char *property, ZlvBool *found)
{
    return getConverted(map, property, found, zlvPropStrToFloat64);
}

ZlvBool ZlvSetMapProp(StringToStringMap *map, const char *property, const char *value)
{
    return zlvIntlStringToStringMapPut(map, property, value);
}

void ZlvSetMapPropBool(StringToStringMap *map, const char *property, uint8_t value)
{
    ZlvSetMapProp(map, property, value == 1 ? "true" : "false");
}

void ZlvSetMapPropChar(StringToStringMap *map, const char *property, char value)
{
    setRendered(map, property, {ZLV_PARM_CHAR, {.byteValue = static_cast<uint8_t>(value)}});
}

void ZlvSetMapPropInt(StringToStringMap *map, const char *property, int32_t value)
{
    setRendered(map, property, {ZLV_PARM_INT, {.intValue = value}});
}

void ZlvSetMapPropLong(StringToStringMap *map, const char *property, int64_t value)
{
    setRendered(map, property, {ZLV_PARM_LONG, {.intValue = static_cast<int32_t>(value)}});
}

void ZlvSetMapPropFloat(StringToStringMap *map, const char *property, float value)
{
    setRendered(map, property, {ZLV_PARM_FLOAT, {.floatValue = value}});
}

void ZlvSetMapPropDouble(StringToStringMap *map, const char *property, double value)
{
    setRendered(map, property, {ZLV_PARM_DOUBLE, {.doubleValue = value}});
}

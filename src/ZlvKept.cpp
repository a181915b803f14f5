// SPDX-License-Identifier: Apache-2.0
#include "ZlvKept.h"

#include "util/CxIcuDefaults.h"
#include "util/CxNumberText.h"

namespace zelvo {
namespace {

constinit DefaultLocale defaultLocale;
constinit DefaultZone defaultZone;
constinit DefaultConverter defaultConverter;

} // namespace

uint64_t defaultLocaleNumber()
{
    return defaultLocale.number();
}

uint64_t defaultZoneNumber()
{
    return defaultZone.number();
}

uint64_t defaultConverterNumber()
{
    return defaultConverter.number();
}

void dropKept()
{
    dropKeptDates();
    dropKeptIntegers();
    dropKeptPatterns();
    dropKeptTexts();
    dropKeptBundles();
    dropKeptNumberFormats();
}

} // namespace zelvo

// SPDX-License-Identifier: Apache-2.0
#include "ZlvKept.h"

#include "util/CxIcuDefaults.h"
#include "util/CxNumberText.h"

namespace zelvo {
namespace {

constinit DefaultLocale defaultLocale;
constinit DefaultZone defaultZone;

} // namespace

uint64_t defaultLocaleNumber()
{
    return defaultLocale.number();
}

uint64_t defaultZoneNumber()
{
    return defaultZone.number();
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

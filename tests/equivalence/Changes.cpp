// SPDX-License-Identifier: Apache-2.0
// Changes of all that a result depends on.
#include <cstdlib>
#include <ctime>
#include <filesystem>

#include <unicode/putil.h>
#include <unicode/ucal.h>
#include <unicode/uclean.h>
#include <unicode/ucnv.h>
#include <unicode/uloc.h>

#include "Choices.h"
#include "Messages.h"
#include "Steps.h"

namespace zelvo_equivalence {
namespace {

void setLocale(World &world)
{
    UErrorCode status = U_ZERO_ERROR;
    const char *name = anyLocale(world.random);
    uloc_setDefault(name, &status);
    world.transcript.note("asked", name);
    world.transcript.note("default", uloc_getDefault());
}

void setZone(World &world)
{
    UErrorCode status = U_ZERO_ERROR;
    const char16_t *name = anyZone(world.random);
    world.transcript.note("asked", UText{name});
    world.clock.watch(name);
    ucal_setDefaultTimeZone(name, &status);
}

void setConverter(World &world)
{
    const char *name = anyConverter(world.random);
    ucnv_setDefaultName(name);
    world.transcript.note("converter", name);
}

void setDataDirectory(World &world)
{
    const char *directory = world.random.oneIn(4) ? "/nowhere/at/all" : MESSAGES;
    u_setDataDirectory(directory);
    world.transcript.note("directory", directory);
}

/// Calls that need no toolkit.
void callWithoutToolkit(World &world)
{
    for (const auto step : {appendNumber, convertText, convertBytes})
        if (world.random.oneIn(2))
            step(world);
}

} // namespace

void setDefaults(World &world)
{
    setDataDirectory(world);
    setConverter(world);
    setLocale(world);
    if (world.random.oneIn(2)) // else the variable TZ has its way
        setZone(world);
}

void changeLocale(World &world)
{
    if (world.hasUnknownLocales)
        return;
    setLocale(world);
    world.transcript.count("changes of the default locale");
}

void changeZone(World &world)
{
    setZone(world);
    world.transcript.count("changes of the default zone");
}

void changeZoneVariable(World &world)
{
    static constexpr const char *zones[] = {"Europe/Berlin", "EST5EDT", ":Asia/Tokyo", "FOO-5",
                                            "FOO-7",         "",        "Nonsense"};
    const char *zone = world.random.of(zones);
    setenv("TZ", zone, 1);
    tzset();
    world.transcript.note("TZ", zone);
}

/// ICU reads TZ when a date is asked for, not earlier.
void meetZoneLate(World &world)
{
    if (!world.endsIcu)
        return;
    world.closeToolkit();
    u_cleanup();
    setDataDirectory(world);
    world.openToolkit();
    changeZoneVariable(world);
    bindMessage(world);
    changeZoneVariable(world);
    formatDate(world);
    world.transcript.count("zones met late");
}

void changeConverter(World &world)
{
    setConverter(world);
    world.transcript.count("changes of the converter");
}

void changeDataDirectory(World &world)
{
    setDataDirectory(world);
}

void changeBundle(World &world)
{
    const bool isThere = std::filesystem::exists(LATE_BUNDLE);
    if (isThere)
        std::filesystem::remove_all(LATE_BUNDLE);
    else
        std::filesystem::copy(MESSAGES "/eqmsg", LATE_BUNDLE);
    world.transcript.note("exists", int64_t{!isThere});
}

void changeProperty(World &world)
{
    world.tree->changeProperty(world.random, world.transcript);
}

void replaceFormatter(World &world)
{
    world.tree->replaceFormatter(world.random, world.transcript);
}

void reopen(World &world)
{
    world.closeToolkit();
    callWithoutToolkit(world);
    world.openToolkit();
    world.transcript.count("closes");
}

void reopenWithoutIcu(World &world)
{
    if (world.random.oneIn(2))
        callWithoutToolkit(world);
    world.closeToolkit();
    callWithoutToolkit(world);
    if (!world.endsIcu)
        return world.openToolkit();
    u_cleanup();
    setDefaults(world);
    callWithoutToolkit(world);
    world.openToolkit();
    world.transcript.count("closes with an end of ICU");
}

} // namespace zelvo_equivalence

// SPDX-License-Identifier: Apache-2.0
#include "Messages.h"

#include <cstring>
#include <initializer_list>

namespace zelvo_equivalence {
namespace {

/// A key of the bundle "eqmsg", whose pattern asks for the same arguments in all locales.
struct Key {
    const char *name;
    std::initializer_list<ArgType> types;
};

constexpr ArgType TEXT = ArgType::TEXT;
constexpr ArgType INTEGER = ArgType::INTEGER;
constexpr ArgType DOUBLE = ArgType::DOUBLE;

const Key KEYS[] = {
    {"plain", {}},
    {"text", {TEXT}},
    {"ints", {INTEGER}},
    {"mix", {TEXT, INTEGER, DOUBLE}},
    {"dates", {DOUBLE, DOUBLE}},
    {"plural", {DOUBLE, TEXT}},
    {"select", {TEXT}},
    {"quoted", {TEXT}},
    {"long", {TEXT}},
    {"broken", {}},
    {"empty", {}},
    {"onlyInRoot", {TEXT}},
    {"onlyInGerman", {INTEGER}},
    {"list", {}},
    {"nowhere", {}},
};

constexpr const char *BUNDLES[] = {
    MESSAGES "/eqmsg",
    MESSAGES "/eqmsg",
    MESSAGES "/eqmsg",
    MESSAGES "/eqmsg/",
    "/nowhere/at/all/eqmsg",
    "eqmsg",
    "/nowhere/at/all/none",
    "none",
    LATE_BUNDLE,
    LATE_BUNDLE,
};

/// Keys of the unit tests' bundle, some of which ask for other arguments in other locales.
constexpr const char *UNTYPED_KEYS[] = {
    "plain",      "named",      "count", "both",     "quoted", "broken",    "empty",
    "onlyInRoot", "identified", "typed", "four",     "gap",    "reversed",  "dated",
    "toggled",    "unquoted",   "tens",  "onlyDate", "allTen", "abandoned", "several"};

/// Keys whose patterns ask for dates.
bool asksForDate(const Message &message)
{
    for (const char *key : {"dates", "dated", "onlyDate"})
        if (message.key != nullptr && std::strcmp(message.key, key) == 0)
            return true;
    return false;
}

Message untypedMessage(Random &random)
{
    return {UNIT_TEST_MESSAGES, random.of(UNTYPED_KEYS), {{}, {}, false}};
}

Message typedMessage(Random &random)
{
    const Key &key = random.of(KEYS);
    return {random.of(BUNDLES), key.name, {{}, key.types, true}};
}

Message strangeMessage(Random &random)
{
    static constexpr const char *keys[] = {nullptr, "", "Version", "NumberElements/latn"};
    return {random.oneIn(2) ? "" : MESSAGES "/eqmsg", random.of(keys), {{}, {}, true}};
}

Message anyOf(Random &random)
{
    const uint32_t kind = random.below(12);
    if (kind == 0)
        return strangeMessage(random);
    return kind < 4 ? untypedMessage(random) : typedMessage(random);
}

} // namespace

Message anyBundleMessage(World &world)
{
    Message message = anyOf(world.random);
    while (world.endsIcu && asksForDate(message))
        message = anyOf(world.random);
    world.transcript.note("bundle", message.bundle);
    world.transcript.note("key", message.key);
    return message;
}

Message anyMessage(World &world)
{
    if (world.random.oneIn(3))
        return anyBundleMessage(world);
    Message message{nullptr, nullptr, world.patterns.next(world.random)};
    world.transcript.note("pattern", UText{message.pattern.text});
    return message;
}

} // namespace zelvo_equivalence

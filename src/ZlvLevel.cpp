// SPDX-License-Identifier: Apache-2.0
// Levels from text.
#include "ZlvLevel.h"

#include <cstdio>
#include <string_view>

#include "CxString.h"

namespace {

struct LevelName {
    std::string_view name;
    ZlvLevel level;
};

constexpr LevelName LEVEL_NAMES[] = {
    {"FATAL", ZLV_LEVEL_FATAL},
    {"ERROR", ZLV_LEVEL_ERROR},
    {"WARN", ZLV_LEVEL_WARN},
    {"INFO", ZLV_LEVEL_INFO},
    {"DEBUG_MIN", ZLV_LEVEL_DEBUG_MIN},
    {"MIN", ZLV_LEVEL_DEBUG_MIN},
    {"DEBUG_MID", ZLV_LEVEL_DEBUG_MID},
    {"MID", ZLV_LEVEL_DEBUG_MID},
    {"DEBUG_MAX", ZLV_LEVEL_DEBUG_MAX},
    {"MAX", ZLV_LEVEL_DEBUG_MAX},
    {"ALL", ZLV_LEVEL_ALL},
    {"OFF", ZLV_LEVEL_OFF},
};

ZlvLevel levelNamed(const char *str)
{
    for (const LevelName &entry : LEVEL_NAMES)
        if (RkoStringNICmp(str, entry.name.data(), entry.name.size()) == 0)
            return entry.level;
    return ZLV_LEVEL_NONE;
}

} // namespace

ZlvLevel ZlvGetLevelFromString(const char *str)
{
    if (str == nullptr)
        return ZLV_LEVEL_NONE;
    ZlvLevel level = ZLV_LEVEL_ALL;
    // NOLINTNEXTLINE(cert-err34-c): trailing text and an early end are accepted, as "%d" does.
    const bool isName = std::sscanf(str, "%d", &level) == 0;
    return isName ? levelNamed(str) : level;
}

// SPDX-License-Identifier: Apache-2.0
// The filter that goes by message identifiers.
#include "ZlvMsgIdFilter.h"

#include <limits>

#include "CxMemory.h"
#include "CxString.h"
#include "ZlvIntl.h"
#include "ZlvPDXMLFormatter.h"
#include "ZlvPropsIntl.h"
#include "ZlvStrTok.h"
#include "util/CxDecimal.h"
#include "util/CxOwned.h"

using namespace zelvo;

namespace {

constexpr int64_t LATEST = std::numeric_limits<int64_t>::max();

MsgIdFilterVars *varsOf(const ZlvObject *filter)
{
    return filter != nullptr ? static_cast<MsgIdFilterVars *>(filter->vars) : nullptr;
}

void applyMode(ZlvObject *filter, MsgIdFilterVars &vars)
{
    const OwnedStr mode{zlvIntlGetObjProp(filter, "mode", nullptr)};
    if (mode)
        vars.mode =
            RkoStringICmp(mode.get(), "PASSTHRU") == 0 ? ZLV_MSG_ID_PASSTHRU : ZLV_MSG_ID_BLOCK;
}

void applyMsgIds(ZlvObject *filter, MsgIdFilterVars &vars)
{
    const OwnedStr patterns{zlvIntlGetObjProp(filter, "msgIds", nullptr)};
    if (!patterns)
        return;
    zlvIntlFreeStringList(vars.patterns);
    vars.patterns = ZlvMsgIdFilterGetStringList(patterns.get());
}

void applyRepeatTime(ZlvObject *filter, MsgIdFilterVars &vars)
{
    ZlvBool found = 0;
    const int64_t time = zlvIntlGetObjPropLong(filter, "msgIdRepeatTime", &found);
    if (found != 0)
        vars.repeatTime = time;
}

struct Setting {
    const char *property;
    void (*apply)(ZlvObject *filter, MsgIdFilterVars &vars);
};

constexpr Setting settings[] = {
    {"mode", applyMode},
    {"msgIds", applyMsgIds},
    {"msgIdRepeatTime", applyRepeatTime},
};

bool passesMode(const MsgIdFilterVars &vars, const char *id)
{
    const bool blocks = vars.mode == ZLV_MSG_ID_BLOCK;
    const bool matches = ZlvMsgIdFilterMatchMsgId(vars.patterns, id) != 0;
    return blocks != matches;
}

/// Whole milliseconds; a time beyond the range of the result gives its nearest end.
int64_t wholeMilliseconds(double time)
{
    constexpr double limit = 9223372036854775808.0;
    if (time >= limit)
        return LATEST;
    return time > -limit ? static_cast<int64_t>(time) : std::numeric_limits<int64_t>::min();
}

/// The time from which on an identifier that passed at LAST may pass again.
int64_t endOfQuiet(int64_t last, int64_t repeatTime)
{
    return last > LATEST - repeatTime ? LATEST : last + repeatTime;
}

/// Tells whether an identifier may pass now, and if so notes that it does.
bool passesRepeat(const MsgIdFilterVars &vars, const char *id, int64_t now)
{
    const StringToStringMapNode *last = zlvIntlStringToStringMapGetNode(vars.lastPassed, id);
    if (last != nullptr &&
        endOfQuiet(zlvPropStrToInt64(last->value, nullptr), vars.repeatTime) > now)
        return false;
    zlvIntlStringToStringMapPut(vars.lastPassed, id, decimalText(now).text);
    return true;
}

bool passes(const MsgIdFilterVars &vars, const char *id, double time)
{
    if (!passesMode(vars, id))
        return false;
    const bool isLimited = id != nullptr && *id != '\0' && vars.repeatTime > 0;
    return !isLimited || passesRepeat(vars, id, wholeMilliseconds(time));
}

} // namespace

void *ZlvMsgIdFilterFAllocVars(void)
{
    auto *vars = static_cast<MsgIdFilterVars *>(RkoMemoryCalloc(1, sizeof(MsgIdFilterVars)));
    if (vars == nullptr)
        return nullptr;
    vars->mode = ZLV_MSG_ID_BLOCK;
    vars->patterns = ZlvMsgIdFilterGetStringList("*W *I");
    vars->lastPassed = zlvIntlAllocStringToStringMap();
    if (vars->patterns == nullptr || vars->lastPassed == nullptr) {
        ZlvMsgIdFilterFFreeVars(vars);
        return nullptr;
    }
    vars->formatter = zlvIntlGetObject("msgFormatter", "zlv_xmlformatter");
    return vars;
}

void ZlvMsgIdFilterFFreeVars(void *vars)
{
    auto *filterVars = static_cast<MsgIdFilterVars *>(vars);
    if (filterVars == nullptr)
        return;
    zlvIntlFreeStringList(filterVars->patterns);
    zlvIntlReleaseObject(filterVars->formatter);
    zlvIntlFreeStringToStringMap(filterVars->lastPassed);
    RkoMemoryFree(filterVars);
}

void ZlvMsgIdFilterFCfgChange(ZlvObject *filter, const char *propertyName)
{
    MsgIdFilterVars *vars = varsOf(filter);
    if (vars == nullptr || propertyName == nullptr)
        return;
    for (const Setting &setting : settings)
        if (RkoStringCmp(propertyName, setting.property) == 0)
            return setting.apply(filter, *vars);
    ZlvBasicObjectFCfgChange(filter, propertyName);
}

int32_t ZlvMsgIdFilterFIsLoggable(ZlvObject *filter, ZlvEvent *event, va_list args)
{
    if (filter == nullptr || event == nullptr)
        return 0;
    const MsgIdFilterVars *vars = varsOf(filter);
    if (vars == nullptr)
        return 1;
    zlvPDXMLUFormatterCacheMessageID(vars->formatter, event, args);
    const OwnedStr id{ZlvGetEventMessageId(event)};
    return passes(*vars, id.get(), ZlvGetEventTime(event)) ? 1 : 0;
}

StringList *ZlvMsgIdFilterGetStringList(const char *text)
{
    StringList *list = zlvIntlAllocStringList();
    if (list == nullptr)
        return nullptr;
    ZlvStrTokIter it;
    ZlvStrTokIterator(&it, text, " \t\n\r");
    for (; ZlvStrTokIterHasNext(it) != 0; ZlvStrTokIterNext(&it, it)) {
        const OwnedStr token{ZlvStrTokIterGet(it)};
        zlvIntlStringListAppend(list, token.get());
    }
    return list;
}

ZlvBool ZlvMsgIdFilterMatchMsgId(StringList *patterns, const char *id)
{
    const StringListNode *node = id != nullptr ? zlvIntlStringListIterator(patterns) : nullptr;
    while (node != nullptr && ZlvPatternMatch(node->element, id) == 0)
        node = node->next;
    return node != nullptr ? 1 : 0;
}

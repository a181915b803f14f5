// SPDX-License-Identifier: Apache-2.0
#include "Outcomes.h"

#include <algorithm>
#include <iterator>

#include <fnmatch.h>

namespace zelvo_test {
namespace {

/// The lines of A that are not in B.
Lines only(Lines a, Lines b)
{
    Lines result;
    std::sort(a.begin(), a.end());
    std::sort(b.begin(), b.end());
    std::set_difference(a.begin(), a.end(), b.begin(), b.end(), std::back_inserter(result));
    return result;
}

#define FORMS "@(Zlv|zlvIntl)"

/// No text of a map's entry: its key, its value or both could not be copied.
#define TEXTLESS "* has @(null=*|*=null)"

constexpr Known OUTCOMES[] = {
    {.name = "an entry of a map has no key or no value",
     .calls = FORMS "@(StringTo*MapPut|Set@(Map|Obj|ObjCfg|Event)Prop*)",
     .answers = "@(|1)",
     .gone = "@(* has *|* absent|* count *)",
     .left = "@(" TEXTLESS "|* has|* count *)"},
    {.name = "a property is not set, and an empty map is left",
     .calls = FORMS "Set@(Obj|ObjCfg|Event)Prop*",
     .answers = "@(|0)",
     .gone = "* absent",
     .left = "* has"},
    {.name = "a copy or a list of tokens lacks elements",
     .calls = "@(" FORMS "Copy@(*List|*Map|I18Msg)|ZlvMsgIdFilterGetStringList)",
     .answers = "@([(]*[)]|bundle * parameters [(][)] *)",
     .gone = "",
     .left = ""},
    {.name = "a character is written in a longer form",
     .calls = "@(CxStringBuffAppendU@(CS2|TF32)Char|zlvRdprDoUU3State)",
     .answers = "@(1|8)",
     .gone = "@(bytes|reader's value) *",
     .left = "@(bytes|reader's value) *"},
    {.name = "digits are not appended, and success is answered",
     .calls = "CxStringBuffAppendUInt64",
     .answers = "1",
     .gone = "",
     .left = ""},
    {.name = "a key is found whose value cannot be copied",
     .calls = "CxPropListCopyStr",
     .answers = "null",
     .gone = "found 0",
     .left = "found 1"},
    {.name = "an entry of a property list has no texts",
     .calls = "CxPropList@(PutStr|Read)*",
     .answers = "0",
     .gone = "props count *",
     .left = "props @(count *|has null=null|has *)"},
    {.name = "a status tells that memory ran out",
     .calls = "@(CxMutexCreate|Zlv@(File|MultiProcFile)UHandlerFProcess)",
     .answers = "p12",
     .gone = "object * variables *",
     .left = "object * variables *"},
    {.name = "a class is registered that nobody finds",
     .calls = "@(" FORMS "Add*Class|zlvToolkitAddClassDef)",
     .answers = "",
     .gone = "",
     .left = "@(class null|named own*)"},
    {.name = "an event has no identifier",
     .calls = "zlvPDXMLUFormatterCacheMessageID",
     .answers = "null",
     .gone = "",
     .left = ""},
    {.name = "an event has no message",
     .calls = "ZlvVaAllocUEvent",
     .answers = "1 level 4 null",
     .gone = "",
     .left = ""},
    {.name = "an empty group of listeners is left",
     .calls = FORMS "AddListener",
     .answers = "",
     .gone = "* listeners absent",
     .left = "* listeners has"},
    {.name = "a date lacks its day or its zone",
     .calls = "ZlvBasicUFormatterFormatDate",
     .answers = "@(''|'+0\\*2;:0\\*2;')",
     .gone = "",
     .left = ""},
    {.name = "a record lacks pieces",
     .calls = "zlvPDXMLEmitU*",
     .answers = "@(|1)",
     .gone = "units *",
     .left = "units *"},
};

/// Registries that disagree, which only closing the toolkit mends.
constexpr const char *FLAWS[] = {
    "a configuration is found, but not listed",
    "a configuration is listed, but not found",
};

bool matches(const std::string &text, const char *pattern)
{
    return fnmatch(pattern, text.c_str(), FNM_EXTMATCH) == 0;
}

bool allMatch(const Lines &lines, const char *pattern)
{
    return std::all_of(lines.begin(), lines.end(),
                       [&](const std::string &line) { return matches(line, pattern); });
}

} // namespace

const Known *knownOutcome(const std::string &call, const std::string &answer, const Lines &before,
                          const Lines &after)
{
    for (const Known &known : OUTCOMES)
        if (matches(call, known.calls) && matches(answer, known.answers) &&
            allMatch(only(before, after), known.gone) && allMatch(only(after, before), known.left))
            return &known;
    return nullptr;
}

bool isKnownFlaw(const std::string &flaw)
{
    return std::find(std::begin(FLAWS), std::end(FLAWS), flaw) != std::end(FLAWS);
}

Lines without(const Lines &lines, const char *pattern)
{
    Lines rest;
    std::copy_if(lines.begin(), lines.end(), std::back_inserter(rest),
                 [&](const std::string &line) { return !matches(line, pattern); });
    return rest;
}

std::string difference(const Lines &first, const Lines &second)
{
    std::string text;
    for (const std::string &line : only(first, second))
        text += "-" + line + "\n";
    for (const std::string &line : only(second, first))
        text += "+" + line + "\n";
    return text;
}

} // namespace zelvo_test

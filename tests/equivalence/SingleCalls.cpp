// SPDX-License-Identifier: Apache-2.0
// Calls that do a piece of a record's work by themselves.
#include <cstdio>
#include <cstdlib>
#include <thread>
#include <vector>

#include "Arguments.h"
#include "Choices.h"
#include "Messages.h"
#include "Steps.h"

using zelvo_test::taken;

namespace zelvo_equivalence {
namespace {

constexpr size_t THREADS = 3;
constexpr size_t CALLS_TOGETHER = 12;

ZlvBool appendOne(CxUStringBuff &buffer, Random &random)
{
    switch (random.below(8)) {
    case 0:
        return CxUStringBuffAppendInt32(&buffer, anyInteger(random));
    case 1:
        return CxUStringBuffAppendInt64(&buffer, static_cast<int64_t>(random.next()));
    case 2:
        return CxUStringBuffAppendUInt64(&buffer, random.next() >> random.below(64));
    case 3:
        return CxUStringBuffAppendUDate(&buffer, anyTime(random));
    case 4:
        return CxUStringBuffAppendUDate(&buffer, anyDouble(random));
    default:
        return CxUStringBuffAppendUDouble(&buffer, anyDouble(random));
    }
}

/// What a thread of callTogether() does, with results that depend on its seed alone.
std::string callsOf(uint64_t seed)
{
    Random random{seed};
    std::string results;
    for (size_t i = 0; i < CALLS_TOGETHER; ++i) {
        CxUStringBuff buffer{};
        appendOne(buffer, random);
        results += shown(taken(CxUStringBuffTakeUStr(&buffer)));
        results += shown(taken(CxUStringDupUCharToStr(anyText(random).c_str())));
        ZlvI18Msg *message =
            ZlvAllocUI18Msg(nullptr, nullptr, random.oneIn(2) ? u"{0}, {3}" : u"{1} {0} {2}");
        zlvSetI18MsgLocale(message, anyLocale(random));
        withUniversalList(
            [&](va_list args) { results += shown(taken(ZlvBindUI18Msg(message, args))); });
        ZlvFreeI18Msg(message);
    }
    return results;
}

/// What the text is when it has gone to a C stream.
Text printed(const UChar *text)
{
    char *bytes = nullptr;
    size_t size = 0;
    std::FILE *stream = open_memstream(&bytes, &size);
    zlvI18PrintUCharAsLocal(stream, text);
    std::fclose(stream);
    const std::string all{bytes, size};
    std::free(bytes); // NOLINT(cppcoreguidelines-no-malloc): the stream has made it
    return all;
}

ZlvParm anyParm(Random &random, std::string &text)
{
    ZlvParm parm{};
    parm.type = ZLV_PARM_BYTE + random.below(ZLV_PARM_STRING - ZLV_PARM_BYTE + 1);
    if (parm.type == ZLV_PARM_STRING)
        parm.value.stringValue = text.data();
    else if (parm.type == ZLV_PARM_DOUBLE)
        parm.value.doubleValue = anyDouble(random);
    else if (parm.type == ZLV_PARM_FLOAT)
        parm.value.floatValue = static_cast<float>(random.below(100000)) / 64;
    else if (parm.type == ZLV_PARM_INT || parm.type == ZLV_PARM_LONG)
        parm.value.intValue = anyInteger(random);
    else
        parm.value.byteValue = static_cast<decltype(parm.value.byteValue)>(random.below(128));
    return parm;
}

} // namespace

void bindMessage(World &world)
{
    Random &random = world.random;
    const Message source = anyMessage(world);
    ZlvI18Msg *message = ZlvAllocUI18Msg(source.bundle, source.key, source.text());
    const char *locale = random.oneIn(3) ? nullptr : anyLocale(random);
    world.transcript.note("locale", locale);
    zlvSetI18MsgLocale(message, locale);
    for (uint32_t i = 1 + random.below(3); i > 0; --i) {
        const Arguments arguments{random, source.pattern, world.transcript};
        arguments.with([&](va_list args) {
            world.transcript.result("is", taken(ZlvBindUI18Msg(message, args)));
        });
        world.transcript.result("icu", int64_t{message->icuError});
        world.transcript.count(message->icuError == 0 ? "messages bound" : "messages not bound");
    }
    ZlvFreeI18Msg(message);
}

void formatDate(World &world)
{
    ZlvObject *formatter = world.tree->formatter(world.random.below(Tree::FORMATTERS));
    world.transcript.note("pattern", formatter->formatter.dateTimeFormat);
    for (uint32_t i = 1 + world.random.below(6); i > 0; --i) {
        world.clock.move(world.random, world.transcript);
        zlvAPIMutexLock();
        UChar *date = ZlvBasicUFormatterFormatDate(formatter, world.clock.now());
        zlvAPIMutexUnlock();
        world.transcript.result("is", taken(date));
        world.transcript.count("dates");
    }
}

void appendNumber(World &world)
{
    CxUStringBuff buffer{};
    for (uint32_t i = 1 + world.random.below(6); i > 0; --i) {
        world.transcript.result("done", int64_t{appendOne(buffer, world.random)});
        CxUStringBuffAppendChar(&buffer, static_cast<char>(' ' + world.random.below(64)));
    }
    world.transcript.result("is", taken(CxUStringBuffTakeUStr(&buffer)));
    world.transcript.count("numbers");
}

void convertText(World &world)
{
    const std::u16string text = anyText(world.random);
    world.transcript.note("text", UText{text});
    world.transcript.result("bytes", taken(CxUStringDupUCharToStr(text.c_str())));
    world.transcript.result("copy", taken(CxUStringDup(text.c_str())));
    world.transcript.result("printed", printed(text.c_str()));
    world.transcript.count("conversions");
}

void convertBytes(World &world)
{
    std::string bytes = anyBytes(world.random);
    world.transcript.note("bytes", Text{bytes});
    world.transcript.result("text", taken(CxUStringDupStrToUChar(bytes.c_str())));
    CxUStringBuff buffer{};
    CxUStringBuffAppendStr(&buffer, bytes.c_str());
    CxUStringBuffAppendChar(&buffer, static_cast<char>(world.random.below(256)));
    CxUStringBuffAppendStrN(&buffer, bytes.data(), static_cast<uint32_t>(bytes.size() / 2));
    world.transcript.result("appended", taken(CxUStringBuffTakeUStr(&buffer)));
    const ZlvParm parm = anyParm(world.random, bytes);
    world.transcript.result("parm", taken(CxUStringParmToStr(&parm)));
    world.transcript.count("conversions");
}

void describe(World &world)
{
    ZlvObject *formatter = world.tree->formatter(Tree::FORMATTERS - 1);
    world.transcript.result("is", taken(ZlvGetObjectDesc(formatter)));
}

void callTogether(World &world)
{
    std::vector<std::string> results(THREADS);
    std::vector<std::thread> threads;
    for (std::string &result : results)
        threads.emplace_back([&result, seed = world.random.next()] { result = callsOf(seed); });
    for (std::thread &thread : threads)
        thread.join();
    for (const std::string &result : results)
        world.transcript.result("is", Text{result});
    world.transcript.count("calls of several threads", THREADS * CALLS_TOGETHER);
}

} // namespace zelvo_equivalence

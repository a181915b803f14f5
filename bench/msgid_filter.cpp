// SPDX-License-Identifier: Apache-2.0
// What a message-ID filter with repeat suppression costs per event, and that its memory grows with
// distinct identifiers only: zelvo_bench_msgid_filter [EVENTS [IDENTIFIERS]]
#include <chrono>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <string>
#include <vector>

#include <malloc.h>

#include "zelvo.h"

namespace {

uint64_t passed;

void count(ZlvObject *, ZlvEvent *, va_list)
{
    ++passed;
}

/// Texts that begin with an identifier of their own each: ABC000000E and on.
std::vector<std::u16string> textsOf(unsigned identifiers)
{
    std::vector<std::u16string> texts;
    for (unsigned i = 0; i < identifiers; ++i) {
        const std::string number = std::to_string(1000000 + i).substr(1);
        texts.push_back(u"ABC" + std::u16string(number.begin(), number.end()) + u"E happened");
    }
    return texts;
}

size_t heapInUse()
{
    return mallinfo2().uordblks;
}

/// Logs EVENTS events, text by text, and gives the nanoseconds that one of them took.
double costOf(ZlvObject *logger, const std::vector<std::u16string> &texts, uint64_t events)
{
    const auto start = std::chrono::steady_clock::now();
    for (uint64_t i = 0; i < events; ++i)
        ZlvLogUText(logger, texts[i % texts.size()].c_str());
    const std::chrono::duration<double, std::nano> took = std::chrono::steady_clock::now() - start;
    return took.count() / static_cast<double>(events);
}

void report(const char *what, double cost)
{
    std::printf("%-44s %9.0f ns/event   heap %8zu KiB   passed %llu\n", what, cost,
                heapInUse() / 1024, static_cast<unsigned long long>(passed));
    std::fflush(stdout);
}

ZlvObject *newFilter(ZlvObject *listener, const char *repeatTime)
{
    ZlvObject *filter = ZlvGetObject(repeatTime, "zlv_msgidfilter");
    ZlvSetObjProp(filter, "msgIdRepeatTime", repeatTime);
    ZlvAddListener(filter, listener);
    return filter;
}

void measure(uint64_t events, const std::vector<std::u16string> &texts)
{
    ZlvAddHandlerClass("bench_counter", nullptr, nullptr, nullptr, nullptr, count, nullptr,
                       nullptr);
    ZlvObject *counter = ZlvGetObject("counter", "bench_counter");
    ZlvObject *plain = newFilter(counter, "0");
    ZlvObject *damping = newFilter(counter, "3600000");
    ZlvObject *logger = ZlvGetObject("app", "zlv_basiclogger");

    report("logger, no listener", costOf(logger, texts, events));
    ZlvAddListener(logger, plain);
    report("message-ID filter, no repeat time", costOf(logger, texts, events));
    ZlvRemListener(logger, plain);

    ZlvAddListener(logger, damping);
    passed = 0;
    report("repeat time: each identifier once", costOf(logger, texts, texts.size()));
    report("repeat time: repeats", costOf(logger, texts, events - texts.size()));

    for (ZlvObject *object : {logger, damping, plain, counter})
        ZlvReleaseObject(object);
}

} // namespace

int main(int argc, char **argv)
{
    const uint64_t events = argc > 1 ? std::strtoull(argv[1], nullptr, 10) : 1000000;
    const auto identifiers =
        argc > 2 ? static_cast<unsigned>(std::strtoul(argv[2], nullptr, 10)) : 10000;
    if (identifiers == 0 || identifiers > 1000000 || events <= identifiers ||
        !ZlvOpenToolkit(nullptr, nullptr))
        return 1;
    std::printf("%llu events, %u identifiers\n", static_cast<unsigned long long>(events),
                identifiers);
    measure(events, textsOf(identifiers));
    ZlvCloseToolkit();
    return 0;
}

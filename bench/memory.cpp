// SPDX-License-Identifier: Apache-2.0
// Whether memory grows with the number of records: zelvo_bench_memory [RECORDS]
//
// Messages from a bundle in two languages, a text that comes again and texts that never do, to
// files that roll over. Prints, for each step, the records so far and what the resident memory has
// grown by, in KiB, since the first step.
#include <cstdio>
#include <cstdlib>
#include <fstream>

#include <unistd.h>

#include "support/Records.h"

using namespace zelvo_bench;

namespace {

constexpr uint64_t FIRST_STEP = 100000;
constexpr uint64_t STEPS = 10;
constexpr size_t LIMIT = 65536;

const Kind inEnglish{"english", "zlv_basiclogger", "zlv_basicformatter", "en", nullptr};
const Kind inGerman{"german", "zlv_basiclogger", "zlv_basicformatter", "de", nullptr};

long residentKiB()
{
    long size = 0;
    long resident = 0;
    std::ifstream("/proc/self/statm") >> size >> resident;
    return resident * (sysconf(_SC_PAGESIZE) / 1024);
}

void logNewText(ZlvObject *logger, uint64_t number)
{
    const std::string text = "Text " + std::to_string(number) + " of {0}";
    const std::u16string wide(text.begin(), text.end());
    ZlvLogUText(logger, wide.c_str(), CLIENT);
}

void logOne(ZlvObject *logger, uint64_t number)
{
    if (number % 10 == 0)
        logNewText(logger, number);
    else if (number % 10 == 1)
        ZlvLogUText(logger, u"Client {0} has gone", CLIENT);
    else
        ZlvLogInfo(logger, ZELVO_BENCH_BUNDLE, "asked", CLIENT, WISH, static_cast<int32_t>(number));
}

/// Logs to both trees in turn.
void logUpTo(uint64_t records, uint64_t &number, const Tree &english, const Tree &german)
{
    for (; number < records; ++number)
        logOne((number / 10 % 2 == 0 ? english : german).logger(), number);
}

void measure(uint64_t records, const Tree &english, const Tree &german)
{
    uint64_t number = 0;
    logUpTo(FIRST_STEP, number, english, german);
    const long first = residentKiB();
    for (uint64_t step = 1; step <= STEPS; ++step) {
        logUpTo(FIRST_STEP + (records - FIRST_STEP) * step / STEPS, number, english, german);
        std::printf("%llu %ld\n", static_cast<unsigned long long>(number), residentKiB() - first);
        std::fflush(stdout);
    }
}

} // namespace

int main(int argc, char **argv)
{
    const uint64_t records = argc > 1 ? std::strtoull(argv[1], nullptr, 10) : 10000000;
    if (records < 2 * FIRST_STEP) {
        std::fprintf(stderr, "at least %llu records\n",
                     static_cast<unsigned long long>(2 * FIRST_STEP));
        return 1;
    }
    const Place place;
    const OpenToolkit toolkit;
    const Tree english(place, inEnglish);
    const Tree german(place, inGerman);
    for (const Tree *tree : {&english, &german}) {
        tree->set("maxFileSize", std::to_string(LIMIT));
        tree->set("maxFiles", "3");
    }
    measure(records, english, german);
    return sizeOf(english.files()[0]) < 2 * LIMIT ? 0 : 1; // it has rolled over
}

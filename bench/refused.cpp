// SPDX-License-Identifier: Apache-2.0
// What a call costs whose level is below the logger's threshold: the call itself, the test that the
// header offers in its place, and the call of the C++ layer. The floor is a call of an empty
// function in a shared object.
#include "empty_call.h"
#include "support/Records.h"
#include "zelvo.hpp"

using namespace zelvo_bench;

namespace {

void log(ZlvObject *logger)
{
    ZlvLogInfo(logger, ZELVO_BENCH_BUNDLE, "asked", CLIENT, WISH, SERIAL);
}

} // namespace

int main(int argc, char **argv)
{
    const Place place;
    const OpenToolkit toolkit;
    const Tree tree(place, LINE);
    const size_t logged = tree.sample().size();
    ZlvObject *logger = tree.logger();
    ZlvSetObjProp(logger, "level", "WARN");

    measureCheap("empty call", zelvoBenchEmptyCall);
    measureCheap("refused", [logger] { log(logger); });
    measureCheap("refused inline", [logger] {
        if (ZlvIsLoggableInline(logger, ZLV_LEVEL_INFO))
            log(logger);
    });
    const zelvo::Logger inCpp(zelvo::Object::share(logger));
    measureCheap("refused in C++",
                 [&inCpp] { inCpp.info(ZELVO_BENCH_BUNDLE, "asked", CLIENT, WISH, SERIAL); });
    const int result = runBenchmarks(argc, argv);
    return sizeOf(tree.files()[0]) == logged ? result : 1;
}

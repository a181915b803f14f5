// SPDX-License-Identifier: Apache-2.0
// A test of what an application logs: a handler keeps the events in memory.
#include <cstdio>

#include "zelvo.hpp"

namespace {

/// The code that is tested.
bool pay(const zelvo::Logger &logger, const char *card, double amount)
{
    if (amount > 1000) {
        logger.debugMin(u"refused {0,number}", amount);
        logger.error("shop", "payment_failed", amount, zelvo::utf16(card));
        return false;
    }
    return true;
}

int failures = 0;

void expect(bool isTrue, const char *claim)
{
    std::printf("%s: %s\n", isTrue ? "ok" : "FAILED", claim);
    failures += isTrue ? 0 : 1;
}

void testPayments()
{
    const zelvo::Logger logger("shop.log", "zlv_basiclogger");
    const zelvo::MemoryHandler memory("test.memory");
    logger.addListener(memory);

    pay(logger, "Visa", 10);
    expect(memory.count() == 0, "a payment that is made is not logged");

    pay(logger, "Visa", 1299);
    const auto events = memory.events();
    expect(events.size() == 2, "one that is refused is logged twice");
    expect(events[0].text == u"refused 1299", "for the developer, with the amount");
    expect(*events[0].property("zlv_prop_srcfunction") == "pay", "and the place in the source");
    expect(events[1].level == ZLV_LEVEL_ERROR, "for the operator, as an error");
    expect(events[1].key == "payment_failed", "under its key");
    memory.clear();
}

} // namespace

int main()
{
    const zelvo::Toolkit toolkit;
    if (!toolkit)
        return 1;
    testPayments();
    return failures;
}

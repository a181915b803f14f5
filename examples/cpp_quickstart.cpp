// SPDX-License-Identifier: Apache-2.0
// The smallest program that logs in C++: a logger, a console, a few records.
#include <clocale>

#include "zelvo.hpp"

namespace {

/// Something costly that only a record of the lowest level shows.
std::u16string stock()
{
    return u"12 red, 7 green";
}

void takeOrder(const zelvo::Logger &logger, const std::u16string &who, int32_t pieces, double sum)
{
    logger.debugMin(u"{0} orders {1,number,integer} for {2,number}", who, pieces, sum);
    logger.debugMax(u"in stock: {0}", [] { return stock(); });
}

} // namespace

int main()
{
    std::setlocale(LC_ALL, "");
    const zelvo::Toolkit toolkit; // closes last, when the handles below have gone
    if (!toolkit)
        return 1;

    const zelvo::Logger logger("app.log", "zlv_basiclogger");
    const zelvo::Handler console("app.console", "zlv_consolehandler");
    logger.addListener(console);

    logger.text(u"Good morning, {0}", u"Zoë");
    takeOrder(logger, u"Müller & Söhne", 3, 19.5);
    logger.setProperty("level", "DEBUG_MAX");
    takeOrder(logger, u"Zoë", 1, 6.5);
    return 0;
}

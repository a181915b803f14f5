// SPDX-License-Identifier: Apache-2.0
// A message in two languages, each in a file of its own that rolls over.
#include <clocale>
#include <cstdio>

#include "zelvo.hpp"

int main()
{
    std::setlocale(LC_ALL, "");
    const zelvo::Toolkit toolkit("depot.properties");
    if (!toolkit) {
        std::fputs("depot.properties is missing or malformed\n", stderr);
        return 1;
    }
    const zelvo::Logger log("depot.log");

    // The number of a plural is passed as a double.
    for (int parcels = 1; parcels <= 60; parcels++) {
        const auto status = log.info("./bundle", "parcels", static_cast<double>(parcels), u"Zoë");
        if (status.type != CX_STATUS_OK || status.icuError != 0)
            std::fprintf(stderr, "error %d, ICU error %d\n", status.code, status.icuError);
    }
    return 0;
}

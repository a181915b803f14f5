// SPDX-License-Identifier: Apache-2.0
// A message in two languages, each in a file of its own that rolls over.
#include <locale.h>
#include <stdio.h>

#include "zelvo.h"

int main(void)
{
    setlocale(LC_ALL, "");
    if (!ZlvOpenToolkit("depot.properties", NULL)) {
        fputs("depot.properties is missing or malformed\n", stderr);
        return 1;
    }
    ZlvObject *log = ZlvGetObject("depot.log", NULL);

    // The number of a plural is passed as a double.
    for (int parcels = 1; parcels <= 60; parcels++) {
        const ZlvStatus status = ZlvLogInfo(log, "./bundle", "parcels", (double)parcels, u"Zoë");
        if (status.type != CX_STATUS_OK || status.icuError != 0)
            fprintf(stderr, "error %d, ICU error %d\n", (int)status.code, (int)status.icuError);
    }

    ZlvReleaseObject(log);
    ZlvCloseToolkit();
    return 0;
}

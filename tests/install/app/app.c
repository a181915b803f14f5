/* SPDX-License-Identifier: Apache-2.0 */
/* Logs one record to the file app.log, as a user of C99 would. */
#include <zelvo.h>

static const UChar TEXT[] = {'l', 'o', 'g', 'g', 'e', 'd', ' ', 'b', 'y', ' ', 'C', 0};

int main(void)
{
    CxStatus error = {CX_STATUS_OK, 0};
    if (!ZlvOpenToolkit("app.properties", &error))
        return 1;

    ZlvObject *logger = ZlvGetObject("app.log", NULL);
    const ZlvStatus status = ZlvLogUText(logger, TEXT);
    ZlvReleaseObject(logger);
    ZlvCloseToolkit();
    return status.type == CX_STATUS_OK ? 0 : 1;
}

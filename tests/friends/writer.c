// SPDX-License-Identifier: Apache-2.0
// Logs each line of its standard input as one record, and answers with the error number of the
// call: `writer PROPERTIES`, which describe the logger "friend.log".
#include <stdio.h>
#include <string.h>

#include "zelvo.h"

int main(int argc, char **argv)
{
    if (argc != 2 || !ZlvOpenToolkit(argv[1], NULL))
        return 1;
    ZlvObject *logger = ZlvGetObject("friend.log", NULL);
    char line[256];
    while (fgets(line, sizeof line, stdin) != NULL) {
        line[strcspn(line, "\n")] = '\0';
        UChar *text = CxUStringDupStrToUChar(line);
        const ZlvStatus status = ZlvLogUText(logger, u"{0}", text);
        RkoMemoryFree(text);
        printf("%d\n", (int)status.code);
        fflush(stdout);
    }
    ZlvReleaseObject(logger);
    ZlvCloseToolkit();
    return 0;
}

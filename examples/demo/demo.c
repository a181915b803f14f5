// SPDX-License-Identifier: Apache-2.0
// The demo: what zelvo does, told in acts. Start it with `./run demo`.
//
// Read main() first, then tree.c and tills.c. The objects that the acts speak of are not made here:
// the properties file demo.properties describes them.
#include <locale.h>
#include <stdio.h>
#include <stdlib.h>

#include "acts.h"
#include "zelvo.h"

/// Says why the toolkit did not open.
static int refuse(CxStatus error)
{
    const char *reason = ZlvGetPlatformErrStr(error.type, error.code);
    fprintf(stderr, "%s: %s\n", DEMO_PROPERTIES, reason ? reason : "malformed line");
    return 1;
}

int main(int argc, char **argv)
{
    setlocale(LC_ALL, ""); // text is printed in the code page of the user's locale

    CxStatus error = {CX_STATUS_OK, 0};
    if (!ZlvOpenToolkit(DEMO_PROPERTIES, &error))
        return refuse(error);

    if (argc == 3) { // one of the processes that the second act starts
        runTill((int32_t)strtol(argv[1], NULL, 10), argv[2]);
        ZlvCloseToolkit();
        return 0;
    }

    act("one tree, seven levels, three languages");
    showTree();
    act("one file, four processes");
    shareFile();

    act("one event, three layouts, and identifiers that filters know");
    showRecords();

    ZlvCloseToolkit(); // frees every object, configuration and class
    return 0;
}

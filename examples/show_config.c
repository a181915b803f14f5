// SPDX-License-Identifier: Apache-2.0
// Prints what the toolkit understands of a properties file: `show_config app.properties`.
#include <stdio.h>

#include "zelvo.h"

/// Opens the toolkit and says why if that fails.
static int open(const char *path)
{
    CxStatus error = {CX_STATUS_OK, 0}; // only a failure writes it
    if (ZlvOpenToolkit(path, &error))
        return 1;
    const char *reason = ZlvGetPlatformErrStr(error.type, error.code);
    printf("%s\n", reason != NULL ? reason : "a line is malformed");
    return 0;
}

static void showProperties(ZlvObjCfg *cfg)
{
    StringToStringMapIterator it = ZlvObjCfgProperties(cfg);
    for (; ZlvStringToStringMapIterHasNext(it); it = ZlvStringToStringMapIterNext(it)) {
        char *property = ZlvStringToStringMapIterGetKey(it);
        char *value = ZlvStringToStringMapIterGetVal(it);
        printf("  %s = [%s]\n", property, value);
        RkoMemoryFree(property);
        RkoMemoryFree(value);
    }
}

/// Shows the configurations that the file made, in its order.
static void showConfigurations(void)
{
    StringGroupIterator it = ZlvLogMgrConfigNames();
    for (; ZlvStringGroupIterHasNext(it); it = ZlvStringGroupIterNext(it)) {
        char *name = ZlvStringGroupIterGet(it);
        ZlvObjCfg *cfg = ZlvLogMgrGetCfg(name);
        if (ZlvObjCfgIsFromFile(cfg)) {
            printf("%s\n", name);
            showProperties(cfg);
        }
        ZlvReleaseObjCfg(cfg);
        RkoMemoryFree(name);
    }
}

int main(int argc, char **argv)
{
    if (argc != 2 || !open(argv[1]))
        return 1;
    showConfigurations();
    ZlvCloseToolkit();
    return 0;
}

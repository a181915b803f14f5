/* SPDX-License-Identifier: Apache-2.0 */
/* A C99 program that links the shared library: a handler of its own receives what is logged. */
#include <stdio.h>
#include <string.h>

#include "CxMemory.h"
#include "ZlvI18Msg.h"
#include "ZlvIntl.h"
#include "ZlvLogger.h"
#include "ZlvToolkit.h"

static ZlvLevel level_seen;
static char text_seen[64];

static void keep(ZlvObject *handler, ZlvEvent *event, va_list args)
{
    UChar *text = ZlvBindEventUMsg(event, zlvIntlBindUI18Msg, args);
    (void)handler;
    level_seen = ZlvGetEventLevel(event);
    for (size_t i = 0; text != NULL && text[i] != 0 && i + 1 < sizeof text_seen; ++i)
        text_seen[i] = (char)text[i];
    RkoMemoryFree(text);
}

int main(void)
{
    static const UChar pattern[] = {'{', '0', ',', 'n', 'u', 'm', 'b', 'e', 'r', ',',
                                    'i', 'n', 't', 'e', 'g', 'e', 'r', '}', '!', 0};
    CxStatus status = {CX_STATUS_OK, 0};
    ZlvObject *logger;
    ZlvObject *handler;

    if (!ZlvOpenToolkit(NULL, &status))
        return 1;
    ZlvAddHandlerClass("keeper", NULL, NULL, NULL, NULL, keep, NULL, NULL);
    logger = ZlvGetObject("c.logger", "zlv_basiclogger");
    handler = ZlvGetObject("c.handler", "keeper");
    ZlvAddListener(logger, handler);
    ZlvLogDebugMin(logger, __FILE__, "main", __LINE__, pattern, 42);
    ZlvReleaseObject(handler);
    ZlvReleaseObject(logger);
    ZlvCloseToolkit();

    printf("level %d, text %s\n", (int)level_seen, text_seen);
    return level_seen == ZLV_LEVEL_DEBUG_MIN && strcmp(text_seen, "42!") == 0 ? 0 : 1;
}

// SPDX-License-Identifier: Apache-2.0
// Opening and closing the toolkit.
#include "ZlvApiMutex.h"
#include "ZlvBuiltinClasses.h"
#include "ZlvDeferredFree.h"
#include "ZlvKept.h"
#include "ZlvOwned.h"
#include "ZlvToolkitIntl.h"

ZlvBool ZLV_TK_ISOPEN = 0;
ZlvObject *ZLV_TK_ERROR_LOG = nullptr;

namespace {

bool closing = false;

/// Gives the default console, with a formatter bound if it had to be made.
ZlvObject *defaultConsole()
{
    if (ZlvObject *existing = zlvToolkitGetObjInstance(ZLV_DEFAULT_CONSOLE_NAME))
        return existing;
    ZlvObject *console = zlvIntlGetObject(ZLV_DEFAULT_CONSOLE_NAME, "zlv_consolehandler");
    ZlvObject *formatter = zlvToolkitGetObjInstance(ZLV_DEFAULT_FORMATTER_NAME);
    if (formatter == nullptr)
        formatter = zlvIntlGetObject(ZLV_DEFAULT_FORMATTER_NAME, "zlv_basicformatter");
    zlvIntlHandlerSetFormatter(console, formatter);
    return console;
}

/// Gives the error logger, with a console if it had to be made. The references that this and
/// defaultConsole() obtain are the toolkit's own, kept until close frees the objects.
ZlvObject *errorLogger()
{
    if (ZlvObject *existing = zlvToolkitGetObjInstance(ZLV_ERROR_LOGGER_NAME))
        return existing;
    ZlvObject *logger = zlvIntlGetObject(ZLV_ERROR_LOGGER_NAME, "zlv_basiclogger");
    zlvIntlAddListener(logger, defaultConsole());
    return logger;
}

bool openLocked(const char *propertiesPath, CxStatus *status)
{
    zlvInitLogMgr();
    zlvToolkitInitObjClasses();
    if (propertiesPath != nullptr && zlvDoReadProps(propertiesPath, nullptr, status) == 0)
        return false;
    ZLV_TK_ERROR_LOG = errorLogger();
    ZLV_TK_ISOPEN = 1;
    return true;
}

/// Frees everything. What class functions ask for meanwhile is answered from what is left, and
/// nothing new is made for them.
void closeLocked()
{
    closing = true;
    zlvCloseLogMgr();
    zlvFreeInstancesMap();
    zelvo::freeDeferred();
    zelvo::freeClasses();
    zelvo::dropKept();
    ZLV_TK_ISOPEN = 0;
    closing = false;
}

} // namespace

bool zelvo::isClosing()
{
    return closing;
}

ZlvBool ZlvOpenToolkit(const char *propertiesPath, CxStatus *error)
{
    if (zlvAPIMutexLock() == 0)
        return 0;
    CxStatus status{CX_STATUS_OK, 0};
    if (ZLV_TK_ISOPEN == 1 || openLocked(propertiesPath, &status)) {
        zlvAPIMutexUnlock();
        return 1;
    }
    if (error != nullptr)
        *error = status;
    closeLocked();
    zlvAPIMutexUnlock();
    zelvo::destroyApiMutex();
    return 0;
}

void ZlvCloseToolkit(void)
{
    if (zlvAPIMutexLock() == 0)
        return;
    closeLocked();
    zlvAPIMutexUnlock();
    zelvo::destroyApiMutex();
}

ZlvObject *zlvToolkitLogger(void)
{
    return ZLV_TK_ISOPEN == 1 ? ZLV_TK_ERROR_LOG : nullptr;
}

// SPDX-License-Identifier: Apache-2.0
// The handler whose log file several processes share.
//
// Foreign code runs only while the semaphore is not held: the record is rendered before, and passed
// on afterwards.
#include "ZlvMultiProcFileHandler.h"

#include <cerrno>
#include <cstdio>
#include <fcntl.h>
#include <unistd.h>

#include "ZlvFileHandlerIntl.h"
#include "ZlvIntl.h"
#include "util/CxBytes.h"
#include "util/CxStatusIntl.h"

using namespace zelvo;

namespace {

constexpr size_t CHUNK_SIZE = 8192;

bool writeAll(CxFile &file, const char *bytes, size_t length)
{
    size_t count = 0;
    for (size_t done = 0; done < length; done += count)
        if (!isOk(reported(CxFileWrite(&file, bytes + done, length - done, &count))) || count == 0)
            return false;
    return true;
}

void copyContent(CxFile &from, CxFile &to)
{
    char chunk[CHUNK_SIZE];
    size_t length = 0;
    do {
        if (!isOk(reported(CxFileRead(&from, chunk, sizeof chunk, &length))))
            return;
    } while (length > 0 && writeAll(to, chunk, length));
}

/// Copies the live file, which is at its start, into file 1.
void saveLive(FileHandlerVars &vars)
{
    const OwnedStr name{numberedName(vars, 1)};
    CxFile older = -1;
    if (!isOk(
            reported(CxFileOpenMode(&older, name.get(), O_RDWR | O_CREAT, vars.filePermission)))) {
        std::printf("ERR opening %s pre rollover\n", name ? name.get() : "");
        return;
    }
    copyContent(vars.file, older);
    reported(CxFileFlush(&older));
    reported(CxFileClose(&older));
}

/// Measures, rolls over and writes as one step among all processes; gives the first failure.
CxStatus writeGuarded(ZlvObject *handler, FileHandlerVars &vars, const Bytes &record)
{
    if (zlvMultiProcFileHandlerLockSem(handler) != 1)
        return success;
    const CxStatus measured = measureLogFile(vars);
    if (isRolloverDue(vars))
        zlvMultiProcFileHandlerDoRollover(handler);
    size_t count = 0;
    const CxStatus written =
        reported(CxFileWrite(&vars.file, record.get(), record.length(), &count));
    zlvMultiProcFileHandlerUnlockSem(handler);
    return isOk(measured) ? written : measured;
}

CxStatus writeText(ZlvObject *handler, const UChar *text)
{
    FileHandlerVars *vars = varsOf(handler);
    if (vars == nullptr)
        return success;
    const Bytes record{text};
    return record.get() != nullptr ? writeGuarded(handler, *vars, record)
                                   : reported(platformError(ENOMEM));
}

bool isReady(ZlvObject *handler, const FileHandlerVars &vars)
{
    return vars.semReady != 0 || zlvMultiProcFileHandlerInitSem(handler) == 1;
}

} // namespace

void ZlvMultiProcFileUHandlerFProcess(ZlvObject *handler, ZlvEvent *event, va_list args)
{
    const FileHandlerVars *vars = varsOf(handler);
    if (event == nullptr || vars == nullptr || !zlvIntlIsObjectEnabled(handler))
        return;
    noteFailure(event, ZlvMultiProcFileHandlerFOpenWithErr(handler));
    if (vars->isOpen == 0)
        return;
    const OwnedUStr text{zlvIntlUHandlerDoFmt(handler, event, args)};
    if (text)
        noteFailure(event, writeText(handler, text.get()));
    ZlvBasicObjectFLog(handler, event, args);
}

void ZlvMultiProcFileHandlerFOpen(ZlvObject *handler)
{
    ZlvMultiProcFileHandlerFOpenWithErr(handler);
}

CxStatus ZlvMultiProcFileHandlerFOpenWithErr(ZlvObject *handler)
{
    FileHandlerVars *vars = varsOf(handler);
    if (vars == nullptr || vars->fullName == nullptr || vars->isOpen != 0 ||
        !isReady(handler, *vars))
        return success;
    makeLogDirectory(*vars);
    return openLogFile(*vars, O_APPEND);
}

void ZlvMultiProcFileHandlerFClose(ZlvObject *handler)
{
    FileHandlerVars *vars = varsOf(handler);
    if (vars != nullptr && vars->isOpen != 0)
        closeLogFile(*vars);
}

void zlvMultiProcFileHandlerDoRollover(ZlvObject *handler)
{
    const FileHandlerVars *vars = varsOf(handler);
    if (vars == nullptr || vars->maxFiles < 2)
        return;
    shiftLogFiles(*vars, 1);
    zlvMultiProcFileHandlerRollActiveLog(handler);
}

void zlvMultiProcFileHandlerRollActiveLog(ZlvObject *handler)
{
    FileHandlerVars *vars = varsOf(handler);
    if (vars == nullptr)
        return;
    if (isOk(reported(CxFileSeek(&vars->file, 0, SEEK_SET))))
        saveLive(*vars);
    reported(CxFileTrunc(&vars->file));
    reported(CxFileSeek(&vars->file, 0, SEEK_SET));
}

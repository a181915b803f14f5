// SPDX-License-Identifier: Apache-2.0
// The handler that appends to a log file of its own and rolls it over.
//
// A record costs two system calls, the test of the name and the write. The size wanted for the test
// of the limit comes with the test of the name, as long as the name leads to the very file that was
// opened. Only what that cannot tell is asked of the descriptor: the size of a file that is no
// longer the named one, and, before a rollover, whether the descriptor is still good. Otherwise a
// descriptor that was closed behind the handler shows at the write.
//
// Formatters are foreign code. From within a header or a trailer nothing opens or closes the file.
#include "ZlvFileHandler.h"

#include <cerrno>
#include <fcntl.h>

#include "CxString.h"
#include "ZlvFileHandlerIntl.h"
#include "ZlvIntl.h"
#include "util/CxBytes.h"
#include "util/CxFileFacts.h"
#include "util/CxFileIntl.h"
#include "util/CxStatusIntl.h"

using namespace zelvo;

namespace {

FileIdentity identityOf(const FileFacts &facts)
{
    return {facts.device, facts.inode};
}

bool namesRegularFile(const char *name, FileFacts &facts)
{
    LocalName local;
    return isOk(localName(name, local)) && readFacts(local.text, facts) && facts.isRegular;
}

/// Takes the size from the test of the name, if that is the open file and below its limit.
bool assumeSize(FileHandlerState &state, const FileFacts &named)
{
    if (measureEachTime || identityOf(named) != state.opened)
        return false;
    state.vars.currentSize = named.size;
    state.sizeAssumed = !isRolloverDue(state.vars);
    return state.sizeAssumed;
}

/// What follows the test of an open file. A write will find out whether its descriptor is good.
enum class Next { A_WRITE, NOTHING };

enum class LiveFile { READY, GONE, UNREADABLE, FULL };

LiveFile inspect(FileHandlerState &state, Next next)
{
    state.sizeAssumed = false;
    FileFacts named;
    if (!namesRegularFile(state.vars.fullName, named))
        return LiveFile::GONE;
    if (next == Next::A_WRITE && assumeSize(state, named))
        return LiveFile::READY;
    if (!isOk(measureLogFile(state.vars)))
        return LiveFile::UNREADABLE;
    return isRolloverDue(state.vars) ? LiveFile::FULL : LiveFile::READY;
}

/// Writes a header or trailer, if MAKE gives one.
void writeFrame(ZlvObject *handler, char *(*make)(ZlvObject *))
{
    stateOf(handler)->framing = true;
    const OwnedStr text{make(handler)};
    FileHandlerState *state = stateOf(handler);
    if (state == nullptr)
        return;
    state->framing = false;
    size_t count = 0;
    if (text && isOk(reported(
                    CxFileWrite(&state->vars.file, text.get(), RkoStringLen(text.get()), &count))))
        state->vars.currentSize += count;
}

CxStatus openLive(FileHandlerState &state)
{
    const CxStatus status = openLogFile(state.vars, state.vars.appending != 0 ? O_APPEND : O_TRUNC);
    FileFacts facts;
    const bool isKnown = isOk(status) && !measureEachTime && readFacts(state.vars.file, facts);
    state.opened = isKnown ? identityOf(facts) : FileIdentity{};
    state.sizeAssumed = false;
    return status;
}

void rollOver(ZlvObject *handler)
{
    ZlvFileHandlerFClose(handler);
    zlvFileHandlerDoRollover(handler);
    if (FileHandlerVars *vars = varsOf(handler))
        vars->currentSize = 0;
}

/// The state of a handler that has a file to open.
FileHandlerState *namedStateOf(const ZlvObject *handler)
{
    FileHandlerState *state = stateOf(handler);
    return state != nullptr && state->vars.fullName != nullptr ? state : nullptr;
}

bool isFull(FileHandlerVars &vars)
{
    return isOk(measureLogFile(vars)) && isRolloverDue(vars);
}

/// Opens the file, whatever became of the one open before.
CxStatus reopen(ZlvObject *handler)
{
    FileHandlerState *state = namedStateOf(handler);
    if (state == nullptr)
        return success;
    makeLogDirectory(state->vars);
    CxStatus status = openLive(*state);
    if (isOk(status) && isFull(state->vars)) {
        rollOver(handler);
        state = namedStateOf(handler);
        if (state == nullptr)
            return success;
        status = openLive(*state);
    }
    if (isOk(status))
        writeFrame(handler, zlvIntlHandlerGetFmtHeader);
    return status;
}

CxStatus openFor(Next next, ZlvObject *handler)
{
    FileHandlerState *state = namedStateOf(handler);
    if (state == nullptr || state->framing)
        return success;
    const LiveFile live = state->vars.isOpen != 0 ? inspect(*state, next) : LiveFile::UNREADABLE;
    if (live == LiveFile::READY)
        return success;
    if (live == LiveFile::GONE)
        ZlvFileHandlerFClose(handler);
    else if (live == LiveFile::FULL)
        rollOver(handler);
    return reopen(handler);
}

/// Does what a test of the descriptor would have done, where no write has followed after all.
void makeUpForNoWrite(ZlvObject *handler)
{
    const FileHandlerState *state = stateOf(handler);
    if (state != nullptr && state->vars.isOpen != 0 && state->sizeAssumed)
        openFor(Next::NOTHING, handler);
}

/// Writes a record; its bytes are added to a size that was assumed, else the size is measured.
CxStatus append(FileHandlerState &state, const Bytes &record)
{
    size_t count = 0;
    const CxStatus status =
        reported(CxFileWrite(&state.vars.file, record.get(), record.length(), &count));
    if (isOk(status) && state.sizeAssumed)
        state.vars.currentSize += count;
    else if (isOk(status))
        measureLogFile(state.vars);
    return status;
}

/// Tells whether a write has found out what measuring the descriptor would have: it is closed.
bool isFoundClosed(const FileHandlerState &state, CxStatus status)
{
    return status.code == EBADF && state.vars.isOpen != 0 && state.sizeAssumed;
}

CxStatus writeRecord(ZlvObject *handler, const Bytes &record)
{
    FileHandlerState *state = stateOf(handler);
    if (state == nullptr)
        return success;
    const CxStatus written = append(*state, record);
    if (!isFoundClosed(*state, written))
        return written;
    const CxStatus reopened = reopen(handler);
    state = stateOf(handler);
    return isOk(reopened) && state != nullptr ? append(*state, record) : reopened;
}

CxStatus writeText(ZlvObject *handler, const UChar *text)
{
    const Bytes record{text};
    if (record.get() != nullptr)
        return writeRecord(handler, record);
    makeUpForNoWrite(handler);
    return text != nullptr ? reported(platformError(ENOMEM)) : success;
}

} // namespace

void ZlvFileUHandlerFProcess(ZlvObject *handler, ZlvEvent *event, va_list args)
{
    if (event == nullptr || stateOf(handler) == nullptr || !zlvIntlIsObjectEnabled(handler))
        return;
    const CxStatus opened = openFor(Next::A_WRITE, handler);
    noteFailure(event, opened);
    const OwnedUStr text{zlvIntlUHandlerDoFmt(handler, event, args)};
    if (isOk(opened))
        noteFailure(event, writeText(handler, text.get()));
    ZlvBasicObjectFLog(handler, event, args);
}

void ZlvFileHandlerFOpen(ZlvObject *handler)
{
    ZlvFileHandlerFOpenWithErr(handler);
}

CxStatus ZlvFileHandlerFOpenWithErr(ZlvObject *handler)
{
    return openFor(Next::NOTHING, handler);
}

void ZlvFileHandlerFClose(ZlvObject *handler)
{
    const FileHandlerState *state = stateOf(handler);
    if (state == nullptr || state->vars.isOpen == 0 || state->framing)
        return;
    writeFrame(handler, zlvIntlHandlerGetFmtTrailer);
    if (FileHandlerVars *vars = varsOf(handler))
        closeLogFile(*vars);
}

void zlvFileHandlerDoRollover(ZlvObject *handler)
{
    const FileHandlerVars *vars = varsOf(handler);
    if (vars != nullptr && vars->maxFiles > 1)
        shiftLogFiles(*vars, 0);
}

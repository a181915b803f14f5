// SPDX-License-Identifier: Apache-2.0
// The record of the two file handlers, and the steps that both are made of.
#include "ZlvFileHandlerIntl.h"

#include <cerrno>
#include <fcntl.h>

#include "CxFilePath.h"
#include "CxMemory.h"
#include "ZlvObject.h"
#include "util/CxStatusIntl.h"

using namespace zelvo;

namespace {

constexpr FileHandlerVars INITIAL_VARS = {
    .file = -1,
    .isOpen = 0,
    .currentSize = 0,
    .maxBytes = 1024 * 1024,
    .maxFiles = 3,
    .fullName = nullptr,
    .directory = nullptr,
    .base = nullptr,
    .extension = nullptr,
    .number = 0,
    .encoding = nullptr,
    .filePermission = 0744,
    .dirPermission = 0771,
    .appending = 1,
    .semReady = 0,
    .semKey = 31821,
    .semId = -1,
    .logInternalErrs = 1,
};

void reportUnlessAbsent(CxStatus status)
{
    if (status.code != ENOENT)
        reported(status);
}

} // namespace

FileHandlerState *zelvo::stateOf(const ZlvObject *handler)
{
    return handler != nullptr ? static_cast<FileHandlerState *>(handler->vars) : nullptr;
}

FileHandlerVars *zelvo::varsOf(const ZlvObject *handler)
{
    FileHandlerState *state = stateOf(handler);
    return state != nullptr ? &state->vars : nullptr;
}

void *ZlvFileHandlerFAllocVars(void)
{
    auto *state = static_cast<FileHandlerState *>(RkoMemoryMalloc(sizeof(FileHandlerState)));
    if (state == nullptr)
        return nullptr;
    *state = {.vars = INITIAL_VARS, .opened = {}, .sizeAssumed = false, .framing = false};
    nameLogFile(state->vars, "default.log");
    return state;
}

void ZlvFileHandlerFFreeVars(void *vars)
{
    auto *state = static_cast<FileHandlerState *>(vars);
    if (state == nullptr)
        return;
    if (state->vars.isOpen != 0)
        closeLogFile(state->vars);
    RkoMemoryFree(state->vars.fullName);
    RkoMemoryFree(state->vars.directory);
    RkoMemoryFree(state->vars.base);
    RkoMemoryFree(state->vars.extension);
    RkoMemoryFree(state->vars.encoding);
    RkoMemoryFree(state);
}

void zelvo::nameLogFile(FileHandlerVars &vars, const char *name)
{
    zlvFHGetFileNameParts(name, &vars);
    RkoMemoryFree(vars.fullName);
    vars.fullName = zlvSetFileNameParts(vars.directory, vars.base, vars.number, vars.extension);
}

OwnedStr zelvo::numberedName(const FileHandlerVars &vars, int32_t number)
{
    return OwnedStr{zlvSetFileNameParts(vars.directory, vars.base, number, vars.extension)};
}

void zelvo::makeLogDirectory(const FileHandlerVars &vars)
{
    CxFilePath path;
    CxInitFilePath(&path, vars.directory);
    reported(statusOfNumber(CxFilePathMkdirs(&path, vars.dirPermission)));
}

CxStatus zelvo::openLogFile(FileHandlerVars &vars, int32_t flags)
{
    const CxStatus status = reported(
        CxFileOpenMode(&vars.file, vars.fullName, O_RDWR | O_CREAT | flags, vars.filePermission));
    vars.isOpen = isOk(status);
    return status;
}

void zelvo::closeLogFile(FileHandlerVars &vars)
{
    reported(CxFileClose(&vars.file));
    vars.isOpen = 0;
}

CxStatus zelvo::measureLogFile(FileHandlerVars &vars)
{
    return reported(CxFileGetSize(&vars.file, &vars.currentSize));
}

bool zelvo::isRolloverDue(const FileHandlerVars &vars)
{
    const auto limit = static_cast<uint64_t>(int64_t{vars.maxBytes});
    return vars.maxFiles > 1 && vars.currentSize >= limit;
}

void zelvo::shiftLogFiles(const FileHandlerVars &vars, int32_t first)
{
    const int32_t oldest = vars.maxFiles - 1;
    reportUnlessAbsent(CxFileNameRemove(numberedName(vars, oldest).get()));
    for (int32_t number = oldest - 1; number >= first; --number)
        reportUnlessAbsent(CxFileNameRename(numberedName(vars, number).get(),
                                            numberedName(vars, number + 1).get()));
}

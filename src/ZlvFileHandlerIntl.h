// SPDX-License-Identifier: Apache-2.0
// What the two file handlers share: their record, and the steps that both are made of.
#pragma once

#include <sys/types.h>

#include "CxFile.h"
#include "ZlvEvent.h"
#include "ZlvFileHandler.h"
#include "ZlvMisc.h"
#include "util/CxOwned.h"

namespace zelvo {

/// Which file a descriptor was opened on. No file has inode 0, which stands for "not known".
struct FileIdentity {
    dev_t device;
    ino_t inode;

    bool operator==(const FileIdentity &) const = default;
};

/// The variables of a file handler, and what only the code of the handlers knows.
struct FileHandlerState {
    FileHandlerVars vars; ///< first, since an object's variables point to it
    FileIdentity opened;  ///< the file behind vars.file
    bool sizeAssumed;     ///< vars.currentSize was taken from the file's name, not its descriptor
    bool framing;         ///< the formatter is making a header or trailer
};

/// Has the file handler measure its descriptor before and after each write, rather than take the
/// size from the test of the name. What is written and reported is the same; tests compare the two.
inline bool measureEachTime = false;

/// Both are asked for again after each foreign function, which may have had the variables freed.
FileHandlerState *stateOf(const ZlvObject *handler);
FileHandlerVars *varsOf(const ZlvObject *handler);

inline bool isOk(CxStatus status)
{
    return status.type == CX_STATUS_OK;
}

/// Hands a failure to the reporting hook, and the status on.
inline CxStatus reported(CxStatus status)
{
    if (!isOk(status))
        ZlvReportPlatformErr(status.type, status.code);
    return status;
}

inline void noteFailure(ZlvEvent *event, CxStatus status)
{
    if (!isOk(status))
        event->status = status;
}

/// Replaces the parts and the full name by those of a file name.
void nameLogFile(FileHandlerVars &vars, const char *name);

/// The name of the older file of a number; the live file for 0.
OwnedStr numberedName(const FileHandlerVars &vars, int32_t number);

/// Makes the directory of the log file with its parents. A failure is reported, no more: opening
/// the file tells whether it matters.
void makeLogDirectory(const FileHandlerVars &vars);

/// Opens the log file readable and writable, created if need be, with FLAGS besides.
CxStatus openLogFile(FileHandlerVars &vars, int32_t flags);

void closeLogFile(FileHandlerVars &vars);

/// Measures the open file; a failure leaves the size as last known.
CxStatus measureLogFile(FileHandlerVars &vars);

bool isRolloverDue(const FileHandlerVars &vars);

/// Removes the oldest file and renames those from number FIRST on to the next number.
void shiftLogFiles(const FileHandlerVars &vars, int32_t first);

} // namespace zelvo

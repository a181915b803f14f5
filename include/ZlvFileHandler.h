/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvFileHandler.h - the class functions of "zlv_filehandler", which appends records to a log file
 * and keeps a bounded number of older files; what it shares with the handler of
 * ZlvMultiProcFileHandler.h; and, for authors of classes, how log files are named and rolled over.
 * Everything here runs with the API mutex held, unless its comment says that it needs no lock.
 *
 * Names. A log file is named DIRECTORY/BASE[NUMBER][.EXTENSION]. The live file is number 0, which
 * is not written; older files are 1, 2 ... up to the number of files kept less one, a higher number
 * being older.
 */
#ifndef ZLV_FILE_HANDLER_H
#define ZLV_FILE_HANDLER_H

#include "CxFile.h"
#include "ZlvTypes.h"

CX_BEGIN_DECLS

/**
 * The variables of a file handler, made by ZlvFileHandlerFAllocVars() alone, since the handlers
 * keep more behind them. Read with the API mutex held; written by the handler, its texts included.
 */
typedef struct FileHandlerVars {
    CxFile file;             /**< the open log file; -1 while closed */
    uint8_t isOpen;          /**< 1 while the file is open */
    uint64_t currentSize;    /**< bytes in the live file, as last measured or counted */
    int32_t maxBytes;        /**< bytes from which the file rolls over; negative never does */
    int32_t maxFiles;        /**< files kept, the live one included; less than 2 never rolls over */
    char *fullName;          /**< path of the live file; null when none could be composed */
    char *directory;         /**< directory part of the name, without a '/' at its end, or null */
    char *base;              /**< base part, with its leading '/' if the name had one, or null */
    char *extension;         /**< text after the last '.', without the dot; null for none */
    int32_t number;          /**< number that the base ended in, else 0 */
    char *encoding;          /**< property "fileEncoding"; nothing reads it */
    uint32_t filePermission; /**< permission bits of a created file, reduced by the umask */
    uint32_t dirPermission;  /**< permission bits of a created directory, whatever the umask */
    uint8_t appending;       /**< 1 opens at the end, else the file is emptied */
    uint8_t semReady;        /**< 1 once the semaphore is set up (multi-process handler) */
    int32_t semKey;          /**< key of the semaphore (multi-process handler) */
    int32_t semId;           /**< id of the semaphore set, -1 until set up */
    uint8_t logInternalErrs; /**< kept, read by nobody */
} FileHandlerVars;

/**
 * Makes the variables of a file handler, closed, with the defaults that
 * ZlvFileHandlerFCfgChange() lists and the file "default.log" in the working directory, 1048576
 * bytes and 3 files, appending.
 *
 * @return FileHandlerVars, which the toolkit frees with ZlvFileHandlerFFreeVars(); null when memory
 *         ran out
 * @lock the caller holds the API mutex
 */
ZLV_API void *ZlvFileHandlerFAllocVars(void);

/**
 * Frees the variables of a file handler. An open file is closed without a trailer, a failure being
 * handed to ZlvReportPlatformErr().
 *
 * @param vars  what ZlvFileHandlerFAllocVars() gave; null is ignored
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvFileHandlerFFreeVars(void *vars);

/**
 * Takes over a changed property. A change that closes the file does so through the close entry of
 * the handler's own class, and the next record opens it again. "Found" is as in ZlvProps.h: the
 * property is set and converts.
 *
 * - "maxFileSize", "maxFileBytes" (integer, bytes): closes; size from which the file rolls over,
 *   1024 if not found. Both set the same limit: the one applied last wins. It is compared as an
 *   unsigned 64-bit number: a negative limit never rolls, 0 always does.
 * - "maxFiles" (integer): closes; files kept, the live one included, 3 if not found. Less than 2
 *   never rolls over.
 * - "fileName" (text): closes; the log file. When the character before the last '.' (without a
 *   '.', the last one) is a digit, a '_' is put behind it, so that "app2.log" means "app2_.log" and
 *   is not taken for an older file of "app.log". Not found, or longer than 256 bytes: no file
 *   name, and no file is opened.
 * - "appending" (boolean): closes; whether the file is opened at its end (true, also if not found)
 *   or emptied. The multi-process handler always appends.
 * - "filePermission", "dirPermission" (text, octal): closes if found; mode of created files (0744
 *   at first) and directories (0771 at first), from at most four octal digits. A text that does not
 *   begin with one leaves the mode as it is.
 * - "fileEncoding" (text): closes; kept, null if not found. The bytes written do not depend on it.
 * - "MPFileSemKey" (integer): closes; key of the semaphore of the multi-process handler, 31821 at
 *   first and 0 if not found. No effect once that handler has set its semaphore up.
 * - "logInternalErrs" (boolean): closes nothing; sets the flag of that name to the value of the
 *   property "appending", or to 1 if that is not found.
 *
 * Any other name goes to ZlvBasicHandlerFCfgChange().
 *
 * @param handler       the handler; null or one without variables does nothing
 * @param propertyName  the property that has changed; null does nothing
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvFileHandlerFCfgChange(ZlvObject *handler, const char *propertyName);

/**
 * Opens the file, or rolls it over, as ZlvFileHandlerFOpenWithErr() does; writes an event as the
 * handler's formatter renders it, in one write and with nothing added; then passes the event on to
 * the handler's own listeners. A disabled handler does none of it.
 *
 * The event's status receives the first failure: that of opening, after which the record is
 * rendered but not written, or that of writing. A handler without a file name fails to write with
 * 'p'/9 (EBADF); a record whose bytes cannot be allocated fails with 'p'/12. Without text from the
 * formatter nothing is written, and nothing fails. A write that the system cuts short is no
 * failure.
 *
 * @param handler  the handler; null or one without variables does nothing
 * @param event    the event; null does nothing
 * @param args     the message's arguments; copied by each reader, never advanced
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvFileUHandlerFProcess(ZlvObject *handler, ZlvEvent *event, va_list args);

/**
 * Opens the file as ZlvFileHandlerFOpenWithErr() does, whose status is dropped.
 *
 * @param handler  the handler; null or one without variables does nothing
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvFileHandlerFOpen(ZlvObject *handler);

/**
 * Sees to it that the live file is open and below its limit.
 *
 * An open file stays open if its name still leads to a regular file. When it does not (removed,
 * moved away), the handler is closed, trailer included, and the file made again; when its size can
 * no longer be read, it is opened again without being closed. A file that has reached the limit is
 * closed with its trailer and rolled over with zlvFileHandlerDoRollover(), and a new one opened.
 *
 * Opening makes missing directories first, goes on whether or not that succeeds, and creates the
 * file if need be. A file found to have reached the limit already is closed with a trailer, rolled
 * over and opened anew. Each opening, also one at the end of an existing file, writes the
 * formatter's header, if it has one; failing to write it does not fail the opening.
 *
 * Every failure is handed to ZlvReportPlatformErr().
 *
 * @param handler  the handler; null, one without variables or without a file name does nothing, nor
 *                 does a call from within the making of its header or trailer
 * @return '-' when the file is open or there was nothing to do; else the status of the failing
 *         CxFileOpenMode(), and the handler is closed
 * @lock the caller holds the API mutex
 */
ZLV_API CxStatus ZlvFileHandlerFOpenWithErr(ZlvObject *handler);

/**
 * Closes an open file after writing the formatter's trailer, if it has one. Failures are handed to
 * ZlvReportPlatformErr(); the handler is closed in any case.
 *
 * @param handler  the handler; null, one without variables or a closed one does nothing; nor does a
 *                 call from within the making of its header or trailer
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvFileHandlerFClose(ZlvObject *handler);

/**
 * Moves the files of a closed handler on by one: removes the oldest, the one numbered with the
 * files kept less one, and renames each other to the next number, the live file to number 1 last.
 * Failures other than that there is no such file are handed to ZlvReportPlatformErr(), and the rest
 * is done all the same.
 *
 * @param handler  the handler; null, one without variables or one that keeps less than two files
 *                 does nothing
 * @lock the caller holds the API mutex
 */
ZLV_API void zlvFileHandlerDoRollover(ZlvObject *handler);

/**
 * Splits a file name into the parts that the variables keep, freeing those they had. Every '\'
 * counts as '/'.
 *
 * What follows the last '.' is the extension: it is empty, which is not none, when the name ends
 * in '.', and it may hold a '/' when the last '.' is in a directory's name. Digits at the end of
 * what is left are the number; one beyond 32 bits gives its low 32 bits. What remains from the last
 * '/' on, with it, is the base, else all of it; the base may be empty. Before it stands the
 * directory; where there is none, also for a file right under the root, it is the working
 * directory, or null when that cannot be had in 256 bytes, which is handed to
 * ZlvReportPlatformErr().
 *
 * @param name  the file name; null, or one longer than 256 bytes, leaves all parts null, as does
 *              running out of memory
 * @param vars  directory, base, extension and number are replaced; null does nothing
 * @lock none
 */
ZLV_API void zlvFHGetFileNameParts(const char *name, FileHandlerVars *vars);

/**
 * Finds the digit that would be taken for a file's number.
 *
 * @param name  the file name; null gives -1
 * @return index of the character before the last '.', or without a '.' of the last character, if it
 *         is a digit; -1 if it is none or there is no such character
 * @lock none
 */
ZLV_API int32_t zlvFHTrailingBaseDigit(const char *name);

/**
 * Composes a file name: DIRECTORY/BASE[NUMBER][.EXTENSION]. Since a base may begin with '/', the
 * parts of "/var/log/app.log" give "/var/log//app.log".
 *
 * @param directory  null for none; the '/' behind it is then left out
 * @param base       null gives null
 * @param number     written in decimal, unless it is 0
 * @param extension  null for none; the dot before it is then left out
 * @return new string, freed by the caller with RkoMemoryFree(); null without a base or when memory
 *         ran out
 * @lock none
 */
ZLV_API char *zlvSetFileNameParts(const char *directory, const char *base, int32_t number,
                                  const char *extension);

/**
 * Copies a file name with its terminator, turning every '\' into '/'.
 *
 * @param name  the name; null gives 0
 * @param dst   receives the name, left alone on failure; null gives 0
 * @param size  bytes of the destination
 * @return 1 when copied; 0 when an argument is missing or name and terminator do not fit
 * @lock none
 */
ZLV_API ZlvBool zlvGetNativePath(const char *name, char *dst, size_t size);

CX_END_DECLS

#endif

/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvMultiProcFileHandler.h - the class functions of "zlv_multiproc_filehandler", with which
 * several processes append to one log file and share its rollover; and, for authors of classes, its
 * steps. Everything here runs with the API mutex held.
 *
 * Variables and properties are those of ZlvFileHandler.h. All processes must use the same file name
 * and the same "MPFileSemKey". A System V semaphore of that key, 1 when free and 0 when held, makes
 * the test of the size, the rollover and the write one step for all of them; the system gives it
 * back when a process dies holding it. The set of that one semaphore is never removed. The live
 * file keeps its place in a rollover, because the other processes have it open: it is copied and
 * emptied. This handler always appends and writes neither header nor trailer.
 */
#ifndef ZLV_MULTI_PROC_FILE_HANDLER_H
#define ZLV_MULTI_PROC_FILE_HANDLER_H

#include "ZlvTypes.h"

CX_BEGIN_DECLS

/**
 * Opens the file as ZlvMultiProcFileHandlerFOpenWithErr() does and renders the event; then, holding
 * the semaphore, measures the file, rolls it over if it has reached the limit, and writes the
 * record in one write with nothing added. Then it passes the event on to the handler's own
 * listeners. A disabled handler does none of it. While the file is not open the event ends here: it
 * is neither written nor passed on. When the semaphore cannot be had, the record is not written and
 * the event is passed on.
 *
 * The event's status receives the first failure of opening, measuring and writing; a size that
 * cannot be read counts as it was last known. A record whose bytes cannot be allocated fails with
 * 'p'/12. What the semaphore fails with does not reach the event. A write that the system cuts
 * short is no failure.
 *
 * @param handler  the handler; null or one without variables does nothing
 * @param event    the event; null does nothing
 * @param args     the message's arguments; copied by each reader, never advanced
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvMultiProcFileUHandlerFProcess(ZlvObject *handler, ZlvEvent *event, va_list args);

/**
 * Opens the file as ZlvMultiProcFileHandlerFOpenWithErr() does, whose status is dropped.
 *
 * @param handler  the handler; null or one without variables does nothing
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvMultiProcFileHandlerFOpen(ZlvObject *handler);

/**
 * Opens a closed file at its end, after setting the semaphore up, if that is still to do, and
 * making missing directories; failing to make them does not keep the file from being opened. The
 * size is not tested and nothing is written. Failures are handed to ZlvReportPlatformErr().
 *
 * @param handler  the handler; null, one without variables or file name, or an open one does
 *                 nothing
 * @return '-' when the file is open, there was nothing to do, or the semaphore could not be set up,
 *         which leaves the file closed; else the status of the failing CxFileOpenMode()
 * @lock the caller holds the API mutex
 */
ZLV_API CxStatus ZlvMultiProcFileHandlerFOpenWithErr(ZlvObject *handler);

/**
 * Closes an open file. A failure is handed to ZlvReportPlatformErr(); the handler is closed in any
 * case. The semaphore stays set up.
 *
 * @param handler  the handler; null, one without variables or a closed one does nothing
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvMultiProcFileHandlerFClose(ZlvObject *handler);

/**
 * Finds the set of the handler's semaphore key, or makes it, readable and writable by every
 * user, with its semaphore free. The set outlives all processes.
 * Key 0 means a new set that no other handler shares. Failures are handed to
 * ZlvReportPlatformErr().
 *
 * @param handler  the handler; null or one without variables gives 0
 * @return 1 when the semaphore is ready, else 0
 * @lock the caller holds the API mutex
 */
ZLV_API ZlvBool zlvMultiProcFileHandlerInitSem(ZlvObject *handler);

/**
 * Waits for the semaphore and takes it. Rather than stop logging for good, a wait that a signal
 * interrupted (or for which the system has no room) is repeated only so often: after eleven such
 * failures, one second apart, the answer is 1 although the semaphore is not held. Any other failure
 * is handed to ZlvReportPlatformErr().
 *
 * @param handler  the handler; null or one without variables gives 0
 * @return 1 to go ahead, else 0
 * @lock the caller holds the API mutex
 */
ZLV_API ZlvBool zlvMultiProcFileHandlerLockSem(ZlvObject *handler);

/**
 * Gives the semaphore back, if somebody holds it. One that is free already is left at 1, so that it
 * can never admit two, and that is handed to ZlvReportPlatformErr(), as is any failure.
 *
 * @param handler  the handler; null, one without variables, or one whose semaphore is not set up
 *                 does nothing
 * @lock the caller holds the API mutex
 */
ZLV_API void zlvMultiProcFileHandlerUnlockSem(ZlvObject *handler);

/**
 * Moves the older files on by one, removing the oldest, and then the content of the live file into
 * number 1 with zlvMultiProcFileHandlerRollActiveLog(). The caller holds the semaphore. Failures
 * other than that there is no such file are handed to ZlvReportPlatformErr(), and the rest is done
 * all the same.
 *
 * @param handler  the handler; null, one without variables or one that keeps less than two files
 *                 does nothing
 * @lock the caller holds the API mutex
 */
ZLV_API void zlvMultiProcFileHandlerDoRollover(ZlvObject *handler);

/**
 * Copies the content of the open live file into file number 1 and empties the live file. The caller
 * holds the semaphore. The live file is emptied even when the copy fails, which loses its content:
 * a file that nobody can copy must not grow for ever. When file 1 cannot be opened, "ERR opening
 * NAME pre rollover" is printed on the standard output. Failures are handed to
 * ZlvReportPlatformErr().
 *
 * @param handler  the handler; null or one without variables does nothing
 * @lock the caller holds the API mutex
 */
ZLV_API void zlvMultiProcFileHandlerRollActiveLog(ZlvObject *handler);

CX_END_DECLS

#endif

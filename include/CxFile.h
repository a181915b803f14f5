/* SPDX-License-Identifier: Apache-2.0 */
/*
 * CxFile.h - unbuffered files by descriptor, and files by name.
 *
 * Names may be written with '/' or '\': the calls that open, remove or rename turn every '\' into
 * '/'. They take names of up to CX_FILE_NAME_SIZE - 1 bytes; a longer one gives 'p'/36
 * (ENAMETOOLONG) and nothing is touched. No call retries: an interrupted or partial transfer is the
 * caller's to see.
 */
#ifndef CX_FILE_H
#define CX_FILE_H

#include "CxTypes.h"

CX_BEGIN_DECLS

/** Bytes of the longest file name, its terminator included. */
#define CX_FILE_NAME_SIZE 256

/** A POSIX file descriptor, -1 when closed. The caller holds it; the calls take its address. */
typedef int32_t CxFile;

/** What CxFileNameGetInfo() tells about a file: bytes, and seconds since 1970. */
typedef struct CxFileInfo {
    int64_t size;       /**< bytes */
    int64_t changeTime; /**< last change of the file's status */
    int64_t modifyTime; /**< last change of its content */
    int64_t accessTime; /**< last access */
} CxFileInfo;

/**
 * Opens a file, creating it (when the flags say so) readable and writable by its owner alone. The
 * descriptor does not survive exec().
 *
 * @param file  receives the descriptor, which the caller closes with CxFileClose(), or -1 on
 * failure; null gives 'p'/22
 * @param name  the file; null gives 'p'/22
 * @param flags  flags of open(), such as O_RDWR | O_CREAT
 * @return '-', or 'p' with 22, 36 or errno
 * @lock none
 */
ZLV_API CxStatus CxFileOpen(CxFile *file, const char *name, int32_t flags);

/**
 * Opens a file as CxFileOpen(), creating it with the given permissions.
 *
 * @param file  receives the descriptor, which the caller closes with CxFileClose(), or -1 on
 * failure; null gives 'p'/22
 * @param name  the file; null gives 'p'/22
 * @param flags  flags of open()
 * @param mode  permission bits of a created file, reduced by the process umask
 * @return '-', or 'p' with 22, 36 or errno
 * @lock none
 */
ZLV_API CxStatus CxFileOpenMode(CxFile *file, const char *name, int32_t flags, uint32_t mode);

/**
 * Reads once. Fewer bytes than asked for are no error; 0 bytes are the end of the file.
 *
 * @param file  an open file; null gives 'p'/22
 * @param buffer  receives the bytes; null gives 'p'/22
 * @param length  most bytes to read
 * @param count  receives the bytes read, (size_t)-1 when the read failed; null gives 'p'/22; left
 *     alone when another argument is missing
 * @return '-', or 'p' with 22 or errno
 * @lock none
 */
ZLV_API CxStatus CxFileRead(CxFile *file, void *buffer, size_t length, size_t *count);

/**
 * Writes once. A partial write shows in the count alone.
 *
 * @param file  an open file; null gives 'p'/22
 * @param buffer  the bytes; null gives 'p'/22
 * @param length  bytes to write
 * @param count  receives the bytes written, (size_t)-1 when the write failed; null gives 'p'/22;
 * left alone when another argument is missing
 * @return '-', or 'p' with 22 or errno
 * @lock none
 */
ZLV_API CxStatus CxFileWrite(CxFile *file, const void *buffer, size_t length, size_t *count);

/**
 * Moves the position of a file. Only a move to position 0 reports success: any other outcome is 'p'
 * with errno as it stands, even though the position moved. Use it to go to the start; for other
 * positions do not rely on the status.
 *
 * @param file  an open file; null gives 'p'/22
 * @param offset  bytes from the origin; only the low 32 bits count, with their sign
 * @param origin  SEEK_SET, SEEK_CUR or SEEK_END
 * @return '-' at position 0, else 'p' with 22 or errno
 * @lock none
 */
ZLV_API CxStatus CxFileSeek(CxFile *file, int64_t offset, int32_t origin);

/**
 * Goes to the start of a file and empties it. A file that still has content afterwards is always
 * reported as 'p'/22; one that is empty is reported by the step that failed, if any.
 *
 * @param file  a file open for writing; null gives 'p'/22
 * @return '-', or 'p' with 22 or errno
 * @lock none
 */
ZLV_API CxStatus CxFileTrunc(CxFile *file);

/**
 * Gives the size of an open file.
 *
 * @param file  an open file; null gives 'p'/22
 * @param size  receives the size in bytes, left alone on failure; null gives 'p'/22
 * @return '-', or 'p' with 22 or errno
 * @lock none
 */
ZLV_API CxStatus CxFileGetSize(CxFile *file, uint64_t *size);

/**
 * Waits until what was written has reached the device, not only the kernel.
 *
 * @param file  an open file; null gives 'p'/22
 * @return '-', or 'p' with 22 or errno
 * @lock none
 */
ZLV_API CxStatus CxFileFlush(CxFile *file);

/**
 * Closes a file. The descriptor becomes -1 whether or not closing succeeded.
 *
 * @param file  the file, receives -1; null gives 'p'/22
 * @return '-', or 'p' with 22 or errno (9, EBADF, for a descriptor that is not open)
 * @lock none
 */
ZLV_API CxStatus CxFileClose(CxFile *file);

/**
 * Copies a file name, turning every '\' into '/'. The rest of the destination is filled with zero
 * bytes; a name of size bytes or more is cut WITHOUT a terminator.
 *
 * @param name  the name; null gives 0
 * @param dst  receives the name; null gives 0
 * @param size  bytes of the destination; 0 gives 0
 * @return 1 when copied, else 0
 * @lock none
 */
ZLV_API ZlvBool CxFileNameLocalize(const char *name, char *dst, size_t size);

/**
 * Copies a file name in the platform's form, as CxFileNameLocalize(), but a size of 0 is taken: it
 * copies nothing and succeeds.
 *
 * @param name  the name; null gives 0
 * @param dst  receives the name; null gives 0
 * @param size  bytes of the destination
 * @return 1 when copied, else 0
 * @lock none
 */
ZLV_API ZlvBool CxFileNameGetNative(const char *name, char *dst, size_t size);

/**
 * Removes a file or an empty directory.
 *
 * @param name  the file; null gives 'p'/22
 * @return '-', or 'p' with 22, 36 or errno
 * @lock none
 */
ZLV_API CxStatus CxFileNameRemove(const char *name);

/**
 * Renames a file, replacing whatever file bears the new name.
 *
 * @param oldName  the file; null gives 'p'/22
 * @param newName  its new name; null gives 'p'/22
 * @return '-', or 'p' with 22, 36 or errno
 * @lock none
 */
ZLV_API CxStatus CxFileNameRename(const char *oldName, const char *newName);

/**
 * Gives the size of a file. The name is taken as it is, with '\' being a character of it.
 *
 * @param name  the file; null gives 'p'/22
 * @param size  receives the size in bytes, left alone on failure; null gives 'p'/22
 * @return '-', or 'p' with 22 or errno
 * @lock none
 */
ZLV_API CxStatus CxFileNameGetSize(const char *name, uint64_t *size);

/**
 * Gives the size and the times of a file. The name is taken as it is, with '\' being a character of
 * it.
 *
 * @param info  receives them, left alone on failure; null gives 'p'/22
 * @param name  the file; null or "" gives 'p'/22
 * @return '-', or 'p' with 22 or errno
 * @lock none
 */
ZLV_API CxStatus CxFileNameGetInfo(CxFileInfo *info, const char *name);

CX_END_DECLS

#endif

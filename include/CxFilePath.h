/* SPDX-License-Identifier: Apache-2.0 */
/* CxFilePath.h - a path of bounded length, its parent, and the creation of directories. */
#ifndef CX_FILE_PATH_H
#define CX_FILE_PATH_H

#include "CxTypes.h"

CX_BEGIN_DECLS

/** Bytes of the longest path, its terminator included. */
#define CX_FILE_PATH_SIZE 256

/** A path, held by the caller and filled by CxInitFilePath(); it owns nothing. */
typedef struct CxFilePath {
    char path[CX_FILE_PATH_SIZE]; /**< the text, with '/' alone, terminated when pathLength >= 0 */
    int32_t pathLength;           /**< its length in bytes; -1 when there is no valid path */
    int32_t lastSeparator;        /**< index of its last '/'; -1 when there is none */
} CxFilePath;

/**
 * Fills a path record, turning every '\' into '/'.
 *
 * @param path  the record; null gives 0
 * @param text  the path; null makes the record invalid and gives 0
 * @return 1 when filled; 0 when an argument is null or the text is too long, which leaves
 * pathLength at -1
 * @lock none
 */
ZLV_API ZlvBool CxInitFilePath(CxFilePath *path, const char *text);

/**
 * Tells whether a path leads to a directory.
 *
 * @param path  the path; null, an invalid or an empty one gives 22 (EINVAL)
 * @return 0 for a directory, 20 (ENOTDIR) for something else, 22, or the errno of stat(), which is
 * 2 (ENOENT) when there is nothing
 * @lock none
 */
ZLV_API int32_t CxFilePathIsDir(const CxFilePath *path);

/**
 * Tells whether a path leads to anything.
 *
 * @param path  the path; null, an invalid or an empty one gives 22 (EINVAL)
 * @return 0 when it does, 22, or the errno of stat(), which is 2 (ENOENT) when there is nothing
 * @lock none
 */
ZLV_API int32_t CxFilePathExists(const CxFilePath *path);

/**
 * Gives what stands before the last '/' of a path. The parent of "/a" is the empty path; "a" has no
 * parent.
 *
 * @param path  the path; null or an invalid one gives 0
 * @param parent  receives the parent, may be the same record as path; null gives 0
 * @return 1 when filled; 0, with nothing written, when an argument is missing or there is no '/'
 * @lock none
 */
ZLV_API ZlvBool CxFilePathParent(const CxFilePath *path, CxFilePath *parent);

/**
 * Creates a directory and its missing ancestors. Each created directory gets exactly the given
 * permissions, whatever the umask; directories that exist are left alone. A missing directory
 * directly under the root cannot be created: its parent is the empty path, which gives 22.
 *
 * @param path  the directory; null, an invalid or an empty one gives 22 (EINVAL)
 * @param mode  permission bits of every directory created
 * @return 0 when the directory exists or was created, 20 (ENOTDIR) when something else is in the
 *     way, 22, or errno
 * @lock none
 */
ZLV_API int32_t CxFilePathMkdirs(const CxFilePath *path, uint32_t mode);

CX_END_DECLS

#endif

/* SPDX-License-Identifier: Apache-2.0 */
/* CxDirectory.h - listing a directory. */
#ifndef CX_DIRECTORY_H
#define CX_DIRECTORY_H

#include "CxTypes.h"

CX_BEGIN_DECLS

/** Handle of an open directory; null when closed. The caller holds it; the calls take its address.
 */
typedef void *CxDirectory;

/**
 * Opens a directory for listing. Whatever keeps the path from being confirmed as a directory - too
 * long for a CxFilePath, absent, out of reach, another kind of file - gives 'p'/22.
 *
 * @param slot  receives the handle, which the caller closes with CxDirectoryClose(), or null on
 *     failure; null gives 'p'/22
 * @param path  the directory, '\' standing for '/'; null gives 'p'/22
 * @return '-', or 'p' with 22 or errno
 * @lock none
 */
ZLV_API CxStatus CxDirectoryOpen(CxDirectory *slot, const char *path);

/**
 * Gives the name of the next entry, in the file system's own order, "." and ".." among them. An
 * empty name with '-' is the end of the listing.
 *
 * @param slot  an open directory; null, or a closed one, gives 'p'/22
 * @param name  receives the name, cut to size bytes, and a terminator: room for size + 1 bytes;
 * null gives 'p'/22
 * @param size  most bytes of the name
 * @return '-', or 'p' with 22 or errno
 * @lock none
 */
ZLV_API CxStatus CxDirectoryGetNext(CxDirectory *slot, char *name, size_t size);

/**
 * Closes a directory. The slot is emptied whether or not closing succeeded.
 *
 * @param slot  the directory, receives null; null, or a closed one, gives 'p'/22
 * @return '-', or 'p' with 22 or errno
 * @lock none
 */
ZLV_API CxStatus CxDirectoryClose(CxDirectory *slot);

CX_END_DECLS

#endif

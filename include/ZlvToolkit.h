/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvToolkit.h - opening and closing the toolkit, and the one mutex that serialises its interface.
 */
#ifndef ZLV_TOOLKIT_H
#define ZLV_TOOLKIT_H

#include "ZlvTypes.h"

CX_BEGIN_DECLS

/** Name of the toolkit's own logger, of class "zlv_basiclogger", which open makes sure of. */
#define ZLV_ERROR_LOGGER_NAME "zelvo.errorLogger"
/** Name of the console handler that open gives to a new error logger. */
#define ZLV_DEFAULT_CONSOLE_NAME "zelvo.defaultConsole"
/** Name of the formatter of that console, which is also every new handler's first formatter. */
#define ZLV_DEFAULT_FORMATTER_NAME "zelvo.defaultFormatter"

/**
 * Opens the toolkit: registers the built-in classes, reads the properties file if one is named and
 * makes sure of the error logger with its console. Opening an open toolkit does nothing, reads no
 * file and succeeds.
 *
 * A file that cannot be read or is malformed fails the call; the toolkit is closed again with all
 * that was made, and classes registered before are forgotten. `error` then holds what the reader
 * reports: a 'p' status for a file that cannot be opened or read, '-' with code 0 for a malformed
 * line.
 *
 * @param propertiesPath  the properties file; null for none
 * @param error           receives the status of a failure and is left alone otherwise, so set it
 *                        beforehand; null is allowed
 * @return 1 when the toolkit is open on return, else 0 (also when the API mutex cannot be taken)
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvOpenToolkit(const char *propertiesPath, CxStatus *error);

/**
 * Closes the toolkit: frees all configurations, objects and classes, and destroys the API mutex,
 * which the next call makes again. Objects that the application still holds must not be used
 * afterwards, and no other thread may be inside the library. Does no harm when nothing is open.
 *
 * @lock takes the API mutex
 */
ZLV_API void ZlvCloseToolkit(void);

CX_END_DECLS

#endif

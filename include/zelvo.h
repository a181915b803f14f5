/* SPDX-License-Identifier: Apache-2.0 */
/*
 * zelvo.h - the whole public interface of zelvo, a logging toolkit.
 *
 * The conventions below hold for every call; a call's own comment says only what is particular to
 * it. Names: Zlv... is the interface of the toolkit, zlv... and zlvIntl... are for the authors of
 * classes, Cx... and Rko... are the portability layer, which applications may use as well.
 *
 *  1. Life. ZlvOpenToolkit() comes first and ZlvCloseToolkit() last. Classes may be registered
 *     before. Closing frees every object, configuration and class, whoever still holds a reference:
 *     a handle kept across it must not be used, not even to release it.
 *     What ICU has opened for records is kept until then: u_cleanup() comes after it.
 *
 *  2. Handles and references. Objects (ZlvObject) and configurations (ZlvObjCfg) are counted. What
 *     a call hands out carries a reference for the caller, who gives it back with
 *     ZlvReleaseObject() or ZlvReleaseObjCfg(). An object that nobody but the registry refers to is
 *     destroyed at once, and asking for its name again makes a new one from its configuration;
 *     whoever changes an object and wants it to stay holds it. A logger holds its listeners, a
 *     filter too, and a handler its formatter and its listeners.
 *
 *  3. Strings in. Every string that a call keeps, it copies. A const char * is bytes in the code
 *     page of rule 13, a const UChar * is UTF-16, and both end with a zero.
 *
 *  4. Strings out. A returned char * or UChar * is new and belongs to the caller, who frees it with
 *     RkoMemoryFree(), unless the call is named Peek... or ...GetIndex or says that it lends.
 *     Messages, events, typed values and containers have free calls of their own (ZlvFreeI18Msg()
 *     and so on).
 *
 *  5. Null arguments. Every call has a defined result for each null argument: a getter gives
 *     nothing (null, 0, 0.0), a setter does nothing, a portability call answers 'p' with 22
 *     (EINVAL). The tag @param says where null means something else.
 *
 *  6. Found flags. A getter whose "nothing" may also be a value takes a pointer to a ZlvBool that
 *     receives 1 if there was a value and it converted, else 0. The pointer may be null.
 *
 *  7. Truth. A ZlvBool that is 1 means that the operation was carried out, or that the answer is
 *     yes.
 *
 *  8. Status records. A CxStatus has type '-' for success, or 'p' with an error number in errno's
 *     numbering; callers test the type alone. A ZlvStatus, from a logging call, adds the ICU error
 *     of binding the message. A call that refuses a record (level, null or disabled logger) reports
 *     success. The library prints and logs nothing about its own failures.
 *
 *  9. The one mutex. Apart from rule 10, each call takes one process-wide mutex for its whole
 *     length, so any thread may call at any time, except while the toolkit closes. The mutex is not
 *     recursive. A call that cannot take it gives nothing. The tag @lock of a call says what it
 *     does.
 *
 * 10. Calls without the mutex. ZlvIsLoggable() and the first test of each logging call read the
 *     enabled flag and the level atomically, so a refused record costs next to nothing. Levels,
 *     events, typed values, map properties (ZlvProps.h), tokens and the portability layer take no
 *     lock either: their records belong to one thread at a time. ZlvIsLoggable() reads an object
 *     that the caller holds.
 *
 * 11. Class functions. They run with the mutex held. They may call the zlvIntl twins (ZlvIntl.h),
 *     the class functions of other classes and the calls of rule 10; a call that takes the mutex
 *     would wait for itself for ever. So would a public call that logs, at the first level that it
 *     does not refuse: zlvLogUMessageEntry() and zlvLogUDebugEntry() log from there.
 *
 * 12. Iterators. An iterator points at an element and costs nothing to drop. It stays valid until
 *     its element is removed or its container is freed; elements appended later are met. Its getter
 *     hands out a copy of a string, or a further reference to an object. Threads that change a
 *     container while another walks it must agree among themselves.
 *
 * 13. Locale and code page. Messages are bound in the locale of the formatter, or in ICU's default
 *     locale. Texts leave the process in the code page of ICU's default converter, and settings
 *     that become part of a text are read in it. Both defaults follow the environment; an
 *     application calls setlocale(LC_ALL, "") before anything else.
 *     The typed getters of properties read float and double with sscanf(), hence with the decimal
 *     sign of LC_NUMERIC; the setters always write a point.
 *
 * 14. Argument lists. The pattern of a message decides the types of its arguments: {0} is a
 *     const UChar *, {0,number,integer} an int32_t, {0,number} a double. A wrong type is undefined,
 *     as with printf(). A va_list given to a call is never advanced, since each reader copies it:
 *     one list serves several handlers, and the caller may use it again. Where a va_list is a
 *     pointer, a null one stands for zeros.
 *
 * 15. Forks. A fork waits until no other thread is inside a call that takes the mutex, so the child
 *     may log at once. When a class function forks, both processes go on with its event. Open log
 *     files are shared by both processes from then on, and only the class
 *     zlv_multiproc_filehandler keeps their records and rollovers in order. A thread that calls ICU
 *     without the mutex, by itself or through the portability layer, may leave ICU's own locks held
 *     in the child for ever: such a child must not log.
 *
 * 16. Signals. A signal handler must not log, nor call anything else here: the mutex may be held by
 *     the code that it interrupts.
 */
#ifndef ZELVO_H
#define ZELVO_H

#include "CxTypes.h"
#include "ZlvTypes.h"

#include "CxChars.h"
#include "CxDirectory.h"
#include "CxFile.h"
#include "CxFilePath.h"
#include "CxKvtID.h"
#include "CxListUtil.h"
#include "CxMemory.h"
#include "CxMutex.h"
#include "CxProcess.h"
#include "CxPropList.h"
#include "CxString.h"
#include "CxStringBuff.h"
#include "CxSystem.h"
#include "CxThread.h"
#include "CxTrace.h"
#include "CxUString.h"
#include "CxUStringBuff.h"

#include "ZlvBasicFormatter.h"
#include "ZlvConsoleHandler.h"
#include "ZlvEvent.h"
#include "ZlvFileHandler.h"
#include "ZlvHandler.h"
#include "ZlvI18Msg.h"
#include "ZlvIntl.h"
#include "ZlvLevel.h"
#include "ZlvLevelFilter.h"
#include "ZlvListenerGroup.h"
#include "ZlvLogMacros.h"
#include "ZlvLogManager.h"
#include "ZlvLoggable.h"
#include "ZlvLogger.h"
#include "ZlvMisc.h"
#include "ZlvMsgIdFilter.h"
#include "ZlvMultiProcFileHandler.h"
#include "ZlvObjClass.h"
#include "ZlvObjConfig.h"
#include "ZlvObject.h"
#include "ZlvPDLogger.h"
#include "ZlvPDXMLFormatter.h"
#include "ZlvParm.h"
#include "ZlvParmList.h"
#include "ZlvProps.h"
#include "ZlvStrTok.h"
#include "ZlvStringGroup.h"
#include "ZlvStringList.h"
#include "ZlvStringToObjCfgMap.h"
#include "ZlvStringToObjClassMap.h"
#include "ZlvStringToObjMap.h"
#include "ZlvStringToStringMap.h"
#include "ZlvToolkit.h"
#include "ZlvVyxTraceFormatter.h"

#endif

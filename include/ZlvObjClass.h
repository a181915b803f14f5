/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvObjClass.h - classes of objects: their tables of functions, and how an application registers
 * classes of its own.
 *
 * A class is registered once, under a name, and stays until the toolkit is closed. Its functions
 * run with the API mutex held: they may call the zlvIntl twins (ZlvIntl.h) and the calls that take
 * no lock, never a call that takes the mutex.
 */
#ifndef ZLV_OBJ_CLASS_H
#define ZLV_OBJ_CLASS_H

#include "ZlvStringGroup.h"
#include "ZlvTypes.h"

CX_BEGIN_DECLS

/** Kinds of classes. */
enum {
    ZLV_KIND_LOGGER = 101,
    ZLV_KIND_FILTER = 102,
    ZLV_KIND_HANDLER = 103,
    ZLV_KIND_FORMATTER = 104
};

/** Makes the variables of a new object; null is allowed and means none. */
typedef void *(*ZlvFAllocVars)(void);
/** Frees an object's variables; must accept null, which is what is left after an early free. */
typedef void (*ZlvFFreeVars)(void *vars);
/** Told that the property of that name has just been set on the object. */
typedef void (*ZlvFCfgChange)(ZlvObject *object, const char *propertyName);
/** Passes an event on: a logger's or filter's way to its listeners. */
typedef void (*ZlvFLog)(ZlvObject *object, ZlvEvent *event, va_list args);
/** Receives an event from the object that it listens to. */
typedef void (*ZlvFProcess)(ZlvObject *listener, ZlvEvent *event, va_list args);
/** Tells whether a filter accepts an event: it does when the result's low eight bits equal 1. */
typedef int32_t (*ZlvFIsLoggable)(ZlvObject *filter, ZlvEvent *event, va_list args);
/** Opens a handler's output. The toolkit calls it for nobody: a handler opens when it needs to. */
typedef void (*ZlvFOpen)(ZlvObject *handler);
/** Closes a handler's output, as the object is destroyed. */
typedef void (*ZlvFClose)(ZlvObject *handler);
/** Makes an event's record: new text that the caller frees with RkoMemoryFree(), or null. */
typedef UChar *(*ZlvFFormat)(ZlvObject *formatter, ZlvEvent *event, va_list args);
/** Makes what stands first in an output: new text to free with RkoMemoryFree(), or null. */
typedef char *(*ZlvFGetHeader)(ZlvObject *formatter);
/** Makes what stands last in an output: new text to free with RkoMemoryFree(), or null. */
typedef char *(*ZlvFGetTrailer)(ZlvObject *formatter);
/**
 * Binds a message to its final text with the arguments of the logging call; new text or null. The
 * format function of the class calls it, if that cares for it as ZlvBasicUFormatterFFormat() does.
 */
typedef UChar *(*ZlvFBindMsg)(ZlvI18Msg *message, va_list args);

/**
 * A registered class. Class authors read it under the API mutex; only the toolkit writes it. It is
 * owned by the class registry and not counted. `kind` says which of the four tables holds.
 */
struct ZlvObjClass {
    uint32_t kind;
    char *name;
    ZlvI18Msg *description; /**< null when none was given */
    CX_EXTENSION union {
        struct {
            ZlvFLog fLog;
        } logger;
        struct {
            ZlvFProcess fProcess;
            ZlvFIsLoggable fIsLoggable;
            ZlvFLog fLog;
        } filter;
        struct {
            ZlvFProcess fProcess;
            ZlvFOpen fOpen;
            ZlvFClose fClose;
        } handler;
        struct {
            ZlvFFormat fFormat;
            ZlvFGetHeader fGetHeader;
            ZlvFGetTrailer fGetTrailer;
            ZlvFBindMsg fBindMsg;
        } formatter;
    };
    ZlvFAllocVars fAllocVars; /**< null: objects have no variables */
    ZlvFFreeVars fFreeVars;   /**< null: variables are not freed */
    ZlvFCfgChange fCfgChange; /**< null: property changes go unnoticed */
};

/**
 * Registers a class of loggers. The first registration of a name wins: a null name, a name that is
 * taken and exhausted memory register nothing, and nothing is reported. Works before the toolkit is
 * opened too; closing forgets the class. The built-in classes follow the very first registration,
 * or come with the opening: that first class alone may have the name of one of them, and replaces
 * it.
 *
 * @param name         class name, copied; compared exactly
 * @param description  copied; null for none
 * @param allocVars    null for none
 * @param freeVars     null for none
 * @param cfgChange    null for none
 * @param log          null for ZlvBasicObjectFLog()
 * @lock takes the API mutex
 */
ZLV_API void ZlvAddLoggerClass(const char *name, const ZlvI18Msg *description,
                               ZlvFAllocVars allocVars, ZlvFFreeVars freeVars,
                               ZlvFCfgChange cfgChange, ZlvFLog log);

/**
 * Registers a class of filters, under the rules of ZlvAddLoggerClass().
 *
 * @param name         class name, copied; compared exactly
 * @param description  copied; null for none
 * @param allocVars    null for none
 * @param freeVars     null for none
 * @param cfgChange    null for none
 * @param process      null for ZlvBasicFilterFProcess()
 * @param isLoggable   null for ZlvLevelFilterFIsLoggable()
 * @param log          null for ZlvBasicObjectFLog()
 * @lock takes the API mutex
 */
ZLV_API void ZlvAddFilterClass(const char *name, const ZlvI18Msg *description,
                               ZlvFAllocVars allocVars, ZlvFFreeVars freeVars,
                               ZlvFCfgChange cfgChange, ZlvFProcess process,
                               ZlvFIsLoggable isLoggable, ZlvFLog log);

/**
 * Registers a class of handlers, under the rules of ZlvAddLoggerClass().
 *
 * @param name         class name, copied; compared exactly
 * @param description  copied; null for none
 * @param allocVars    null for none
 * @param freeVars     null for none
 * @param cfgChange    null for none
 * @param process      null for ZlvBasicHandlerFProcess(), which does nothing
 * @param open         null for ZlvBasicHandlerFOpen(), which does nothing
 * @param close        null for ZlvBasicHandlerFClose(), which does nothing
 * @lock takes the API mutex
 */
ZLV_API void ZlvAddHandlerClass(const char *name, const ZlvI18Msg *description,
                                ZlvFAllocVars allocVars, ZlvFFreeVars freeVars,
                                ZlvFCfgChange cfgChange, ZlvFProcess process, ZlvFOpen open,
                                ZlvFClose close);

/**
 * Registers a class of formatters, under the rules of ZlvAddLoggerClass().
 *
 * @param name         class name, copied; compared exactly
 * @param description  copied; null for none
 * @param allocVars    null for none
 * @param freeVars     null for none
 * @param cfgChange    null for none
 * @param format       null for ZlvBasicUFormatterFFormat()
 * @param getHeader    null for ZlvBasicFormatterFGetHeader()
 * @param getTrailer   null for ZlvBasicFormatterFGetTrailer()
 * @param bindMsg      null for the binder of ZlvBindUI18Msg()
 * @lock takes the API mutex
 */
ZLV_API void ZlvAddUFormatterClass(const char *name, const ZlvI18Msg *description,
                                   ZlvFAllocVars allocVars, ZlvFFreeVars freeVars,
                                   ZlvFCfgChange cfgChange, ZlvFFormat format,
                                   ZlvFGetHeader getHeader, ZlvFGetTrailer getTrailer,
                                   ZlvFBindMsg bindMsg);

/**
 * Lists the names of the registered logger classes, in the order of their registration.
 *
 * @return iterator over the names, valid until the toolkit is closed, nothing to free; null when
 *         there are none or the API mutex cannot be taken
 * @lock takes the API mutex
 */
ZLV_API StringGroupIterator ZlvGetLoggerClasses(void);

/**
 * Lists the names of the registered filter classes, in the order of their registration.
 *
 * @return as ZlvGetLoggerClasses()
 * @lock takes the API mutex
 */
ZLV_API StringGroupIterator ZlvGetFilterClasses(void);

/**
 * Lists the names of the registered handler classes, in the order of their registration.
 *
 * @return as ZlvGetLoggerClasses()
 * @lock takes the API mutex
 */
ZLV_API StringGroupIterator ZlvGetHandlerClasses(void);

/**
 * Lists the names of the registered formatter classes, in the order of their registration.
 *
 * @return as ZlvGetLoggerClasses()
 * @lock takes the API mutex
 */
ZLV_API StringGroupIterator ZlvGetFormatterClasses(void);

CX_END_DECLS

#endif

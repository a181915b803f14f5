/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvObject.h - objects: loggers, filters, handlers and formatters by name, their properties and
 * their listeners.
 *
 * References. ZlvGetObject() and ZlvAcquireObject() give the caller a reference, which
 * ZlvReleaseObject() takes back. The registry of objects holds one too, which does not keep an
 * object alive: when only that one is left, the object is destroyed.
 */
#ifndef ZLV_OBJECT_H
#define ZLV_OBJECT_H

#include "ZlvLevel.h"
#include "ZlvListenerGroup.h"
#include "ZlvObjClass.h"
#include "ZlvTypes.h"

CX_BEGIN_DECLS

/**
 * An object. Class authors read it under the API mutex; `enabled` and a logger's or filter's
 * `level` are read without it, atomically. The kind of the class says which of the four records
 * holds. A destroyed object has no class.
 */
struct ZlvObject {
    ZlvObjClass *objClass;
    uint32_t refCount; /**< the registry's reference included */
    char *name;
    ZlvBool enabled;
    CX_EXTENSION union {
        struct {
            ZlvLevel level;
            ListenerGroup *listeners;
        } logger;
        struct {
            ZlvLevel level;
            ListenerGroup *listeners;
        } filter;
        struct {
            ListenerGroup *listeners;
            ZlvObject *formatter; /**< a counted reference, or null */
            void *reserved;       /**< null; free for the handler's class */
        } handler;
        struct {
            char *separator;
            char *dateTimeFormat;
            char *locale;
        } formatter;
    };
    StringToStringMap *properties; /**< null until the first property is set */
    void *vars;                    /**< what the class's allocVars made */
};

/**
 * Gets the object of that name, or creates it and applies its configuration to it.
 *
 * An existing object is found when no class is asked for or its class has exactly the name asked
 * for. A new one gets the class asked for or, without one, the class named by the inherited
 * property "className" of the configuration of the object's name (which creates an empty
 * configuration where there is none). Before the toolkit is opened, objects can be created only
 * once some class has been registered.
 *
 * @param name       object name, copied; null gives null
 * @param className  class name; null for whatever class the object or its configuration has
 * @return the object with a reference for the caller, who gives it back with ZlvReleaseObject();
 *         null when the name is taken by an object of another class, the class is not known, memory
 *         ran out or the API mutex cannot be taken
 * @lock takes the API mutex
 */
ZLV_API ZlvObject *ZlvGetObject(const char *name, const char *className);

/**
 * Adds a reference to an object.
 *
 * @param object  null gives null
 * @return the same object, to be released once more; null when the API mutex cannot be taken
 * @lock takes the API mutex
 */
ZLV_API ZlvObject *ZlvAcquireObject(ZlvObject *object);

/**
 * Gives a reference back. When only the registry's is left, the object is destroyed: it leaves the
 * registry, a handler is closed, its listeners and its formatter are released.
 *
 * @param object  null is ignored; must not be used afterwards unless another reference is held
 * @lock takes the API mutex
 */
ZLV_API void ZlvReleaseObject(ZlvObject *object);

/**
 * Copies an object's name.
 *
 * @param object  null gives null
 * @return new string, freed by the caller with RkoMemoryFree(); null when memory ran out or the API
 *         mutex cannot be taken
 * @lock takes the API mutex
 */
ZLV_API char *ZlvGetObjectName(ZlvObject *object);

/**
 * Binds the description of an object's class to text, in the default locale. A description with
 * placeholders is bound with zeros; one that asks for a text cannot be bound.
 *
 * @param object  null gives null
 * @return new text, freed by the caller with RkoMemoryFree(); null when the class has no
 *         description, it cannot be bound or the API mutex cannot be taken
 * @lock takes the API mutex
 */
ZLV_API UChar *ZlvGetObjectDesc(ZlvObject *object);

/**
 * Tells whether two handles mean the same object.
 *
 * @param a  may be null
 * @param b  may be null
 * @return 1 when both are the same pointer (two nulls too), else 0
 * @lock none
 */
ZLV_API ZlvBool ZlvAreObjectsEqual(const ZlvObject *a, const ZlvObject *b);

/**
 * Tells whether an object is enabled. A disabled logger refuses every event, a disabled filter or
 * handler ignores what it is given.
 *
 * @param object  null gives 0
 * @return 1 when enabled; 0 when not or when the API mutex cannot be taken
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvIsObjectEnabled(ZlvObject *object);

/**
 * Enables or disables an object. The property "logging" does the same from a configuration.
 *
 * @param object   null is ignored
 * @param enabled  0 disables, anything else enables
 * @lock takes the API mutex
 */
ZLV_API void ZlvSetObjectEnabled(ZlvObject *object, ZlvBool enabled);

/**
 * Asks a filter's accept entry about an event.
 *
 * @param filter  an object of a filter class; null or another kind gives 0
 * @param event   null gives 0
 * @param args    arguments of the event's message, for an entry that binds it; not consumed
 * @return the entry's result; 0 when there is no entry or the API mutex cannot be taken
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvIsLoggableByFilter(ZlvObject *filter, ZlvEvent *event, va_list args);

/**
 * Reads an object's property as text.
 *
 * @param object    null gives null
 * @param property  property name, compared exactly; null gives null
 * @param found     receives 1 when there is a value, else 0; may be null
 * @return new string, freed by the caller with RkoMemoryFree(); null when there is no value
 * @lock takes the API mutex
 */
ZLV_API char *ZlvGetObjProp(ZlvObject *object, const char *property, ZlvBool *found);

/**
 * Reads an object's property as a truth value: "true" or "false", ignoring case.
 *
 * @param object    null gives 0
 * @param property  property name, compared exactly; null gives 0
 * @param found     receives 1 when there is a value and it converts, else 0; may be null
 * @return the value; 0 when not found
 * @lock takes the API mutex
 */
ZLV_API ZlvBool ZlvGetObjPropBool(ZlvObject *object, const char *property, ZlvBool *found);

/**
 * Reads an object's property as a 32-bit number, as sscanf's "%d" does.
 *
 * @param object    null gives 0
 * @param property  property name, compared exactly; null gives 0
 * @param found     receives 1 when there is a value and it converts, else 0; may be null
 * @return the value; 0 when not found
 * @lock takes the API mutex
 */
ZLV_API int32_t ZlvGetObjPropInt(ZlvObject *object, const char *property, ZlvBool *found);

/**
 * Reads an object's property as a 64-bit number, as sscanf's "%lld" does.
 *
 * @param object    null gives 0
 * @param property  property name, compared exactly; null gives 0
 * @param found     receives 1 when there is a value and it converts, else 0; may be null
 * @return the value; 0 when not found
 * @lock takes the API mutex
 */
ZLV_API int64_t ZlvGetObjPropLong(ZlvObject *object, const char *property, ZlvBool *found);

/**
 * Reads an object's property as a float, as sscanf's "%f" does.
 *
 * @param object    null gives 0
 * @param property  property name, compared exactly; null gives 0
 * @param found     receives 1 when there is a value and it converts, else 0; may be null
 * @return the value; 0 when not found
 * @lock takes the API mutex
 */
ZLV_API float ZlvGetObjPropFloat(ZlvObject *object, const char *property, ZlvBool *found);

/**
 * Reads an object's property as a double, as sscanf's "%lf" does.
 *
 * @param object    null gives 0
 * @param property  property name, compared exactly; null gives 0
 * @param found     receives 1 when there is a value and it converts, else 0; may be null
 * @return the value; 0 when not found
 * @lock takes the API mutex
 */
ZLV_API double ZlvGetObjPropDouble(ZlvObject *object, const char *property, ZlvBool *found);

/**
 * Sets an object's property and tells the object's class, which turns it into behaviour.
 *
 * @param object    null is ignored
 * @param property  property name, copied; null is ignored
 * @param value     text, copied; null removes the value: the class is told, and reading it then
 *                  finds nothing
 * @lock takes the API mutex
 */
ZLV_API void ZlvSetObjProp(ZlvObject *object, const char *property, const char *value);

/**
 * Sets an object's property to a truth value, as ZlvSetObjProp() does.
 *
 * @param object    null is ignored
 * @param property  property name, copied; null is ignored
 * @param value     1 is stored as "true", anything else as "false"
 * @lock takes the API mutex
 */
ZLV_API void ZlvSetObjPropBool(ZlvObject *object, const char *property, ZlvBool value);

/**
 * Sets an object's property to a number, as ZlvSetObjProp() does.
 *
 * @param object    null is ignored
 * @param property  property name, copied; null is ignored
 * @param value     stored in decimal
 * @lock takes the API mutex
 */
ZLV_API void ZlvSetObjPropInt(ZlvObject *object, const char *property, int32_t value);

/**
 * Sets an object's property to a number, as ZlvSetObjProp() does.
 *
 * @param object    null is ignored
 * @param property  property name, copied; null is ignored
 * @param value     its low 32 bits are stored, as a signed decimal
 * @lock takes the API mutex
 */
ZLV_API void ZlvSetObjPropLong(ZlvObject *object, const char *property, int64_t value);

/**
 * Sets an object's property to a float, as ZlvSetObjProp() does.
 *
 * @param object    null is ignored
 * @param property  property name, copied; null is ignored
 * @param value     stored with six fraction digits
 * @lock takes the API mutex
 */
ZLV_API void ZlvSetObjPropFloat(ZlvObject *object, const char *property, float value);

/**
 * Sets an object's property to a double, as ZlvSetObjProp() does.
 *
 * @param object    null is ignored
 * @param property  property name, copied; null is ignored
 * @param value     stored with six fraction digits
 * @lock takes the API mutex
 */
ZLV_API void ZlvSetObjPropDouble(ZlvObject *object, const char *property, double value);

/**
 * Makes one object listen to another: it receives, after those added before it, what the other
 * passes on. Only filters and handlers are given events. A listener is in the group once.
 *
 * @param object    a logger, filter or handler; others and null are ignored
 * @param listener  gets one more reference, which the group holds; null is ignored
 * @lock takes the API mutex
 */
ZLV_API void ZlvAddListener(ZlvObject *object, ZlvObject *listener);

/**
 * Ends what ZlvAddListener() began and releases the group's reference.
 *
 * @param object    null is ignored
 * @param listener  one that does not listen, or null, is ignored
 * @lock takes the API mutex
 */
ZLV_API void ZlvRemListener(ZlvObject *object, ZlvObject *listener);

/**
 * Lists the listeners of an object, first added first.
 *
 * @param object  null gives an empty iterator
 * @return iterator for the ZlvListenerGroupIter calls, nothing to free; null when there are no
 *         listeners or the API mutex cannot be taken. It stays valid while no listener is removed.
 * @lock takes the API mutex
 */
ZLV_API ListenerGroupIterator ZlvGetListeners(ZlvObject *object);

/**
 * Hands an event to each listener of an object in the order of their addition: the default log
 * entry of loggers and filters. Filters and handlers get it, other kinds are skipped. A listener
 * that is passing on this very event already is skipped as well, so a circle of listeners ends;
 * listeners removed meanwhile are not called, those appended are.
 *
 * @param object  null or a disabled object does nothing
 * @param event   the event
 * @param args    the arguments of its message
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvBasicObjectFLog(ZlvObject *object, ZlvEvent *event, va_list args);

/**
 * Applies the properties that every object knows: the configuration-change function that those of
 * classes fall back to. "logging" enables ("on", "true") or disables ("off", "false", ignoring
 * case) the object; "listenerNames" replaces its listeners by the objects of those names, separated
 * by white space; "description", "descriptionFile", "descriptionSet" and "descriptionKey" are
 * accepted without effect, since an object's description is that of its class; others are ignored.
 *
 * @param object        null does nothing
 * @param propertyName  compared exactly; null does nothing
 * @lock the caller holds the API mutex
 */
ZLV_API void ZlvBasicObjectFCfgChange(ZlvObject *object, const char *propertyName);

CX_END_DECLS

#endif

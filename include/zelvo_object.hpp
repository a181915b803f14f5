// SPDX-License-Identifier: Apache-2.0
/*
 * zelvo_object.hpp - owning handles: the toolkit, objects and configurations. Part of the C++
 * layer; see zelvo.hpp.
 */
#ifndef ZELVO_OBJECT_HPP
#define ZELVO_OBJECT_HPP

#include <optional>
#include <utility>
#include <vector>

#include "ZlvHandler.h"
#include "ZlvObject.h"
#include "ZlvToolkit.h"
#include "zelvo_handle.hpp"
#include "zelvo_text.hpp"

namespace zelvo {
inline namespace v1 {

/**
 * Opens the toolkit and closes it. A program has one at a time. Every handle of an object or a
 * configuration has to be gone before it closes, so it is the first to be made; a handle of static
 * life is emptied with reset() in time.
 */
class Toolkit {
public:
    /**
     * Opens the toolkit.
     *
     * @param propertiesPath  the properties file; null for none
     * @lock takes the API mutex
     */
    explicit Toolkit(const char *propertiesPath = nullptr) noexcept
        : isOpen_(ZlvOpenToolkit(propertiesPath, &error_) == 1)
    {
    }
    Toolkit(const Toolkit &) = delete;
    Toolkit &operator=(const Toolkit &) = delete;

    /**
     * Closes the toolkit, if it could be opened.
     *
     * @lock takes the API mutex
     */
    ~Toolkit()
    {
        if (isOpen_)
            ZlvCloseToolkit();
    }

    /** True when the toolkit is open. @lock none */
    explicit operator bool() const noexcept { return isOpen_; }

    /**
     * Tells why the toolkit could not be opened.
     *
     * @return what ZlvOpenToolkit() reports of a failure; {'-', 0} without one
     * @lock none
     */
    CxStatus error() const noexcept { return error_; }

private:
    CxStatus error_{CX_STATUS_OK, 0};
    bool isOpen_;
};

/**
 * Holds a reference to an object of any kind, or nothing. Copies hold references of their own. An
 * object lives as long as somebody holds it.
 *
 * @lock takes the API mutex, unless the handle is empty
 */
class Object : public Handle<ZlvObject, ZlvAcquireObject, ZlvReleaseObject> {
public:
    /** Holds nothing. */
    Object() noexcept = default;

    /**
     * Gets the object of that name, or creates it, as ZlvGetObject() does. The handle is empty when
     * there is no such object and none can be made.
     *
     * @param name       object name; null gives none
     * @param className  class name; null for whatever class the object or its configuration has
     */
    explicit Object(const char *name, const char *className = nullptr) noexcept
        : Handle(ZlvGetObject(name, className))
    {
    }

    /**
     * Takes over a reference of the caller's.
     *
     * @param object  the object; null for none
     * @return the handle
     * @lock none
     */
    static Object adopt(ZlvObject *object) noexcept { return Object(Handle(object)); }

    /**
     * Adds a reference to an object that somebody else holds.
     *
     * @param object  the object; null for none
     * @return the handle
     */
    static Object share(ZlvObject *object) noexcept
    {
        return Object(Handle(ZlvAcquireObject(object)));
    }

    /**
     * Copies the object's name.
     *
     * @return the name; none for an empty handle
     */
    String name() const noexcept { return String(ZlvGetObjectName(get())); }

    /**
     * Binds the description of the object's class.
     *
     * @return the text; none when the class has none
     */
    UString description() const noexcept { return UString(ZlvGetObjectDesc(get())); }

    /**
     * Tells whether the object is enabled.
     *
     * @return true if it is
     */
    bool enabled() const noexcept { return ZlvIsObjectEnabled(get()) == 1; }

    /**
     * Enables or disables the object.
     *
     * @param enabled  true to enable
     */
    void setEnabled(bool enabled) const noexcept { ZlvSetObjectEnabled(get(), enabled ? 1 : 0); }

    /**
     * Reads a property as text.
     *
     * @param name  property name
     * @return the value; none when there is none
     */
    String property(const char *name) const noexcept
    {
        return String(ZlvGetObjProp(get(), name, nullptr));
    }

    /**
     * Reads a property as bool, int32_t, int64_t, float or double.
     *
     * @param name  property name
     * @return the value; nothing when there is none or it does not convert
     */
    template <class T>
    std::optional<T> property(const char *name) const noexcept
    {
        return detail::read<T>(detail::pick<T>(ZlvGetObjPropBool, ZlvGetObjPropInt,
                                               ZlvGetObjPropLong, ZlvGetObjPropFloat,
                                               ZlvGetObjPropDouble),
                               get(), name);
    }

    /**
     * Sets a property, which the object's class turns into behaviour.
     *
     * @param name   property name
     * @param value  text, copied; null removes the value
     */
    void setProperty(const char *name, const char *value) const noexcept
    {
        ZlvSetObjProp(get(), name, value);
    }

    /**
     * Sets a property to a bool, an int32_t, a float or a double.
     *
     * @param name   property name
     * @param value  stored as ZlvSetObjPropBool() and its like do
     */
    template <class T, class = std::enable_if_t<!std::is_null_pointer_v<T>>>
    void setProperty(const char *name, T value) const noexcept
    {
        detail::set(detail::pickSetter<T>(ZlvSetObjPropBool, ZlvSetObjPropInt, ZlvSetObjPropFloat,
                                          ZlvSetObjPropDouble),
                    get(), name, value);
    }

    /**
     * Makes another object listen to this one, a logger, filter or handler.
     *
     * @param listener  a filter or handler, which this object holds from now on
     */
    void addListener(const Object &listener) const noexcept
    {
        ZlvAddListener(get(), listener.get());
    }

    /**
     * Ends what addListener() began.
     *
     * @param listener  one that does not listen is ignored
     */
    void removeListener(const Object &listener) const noexcept
    {
        ZlvRemListener(get(), listener.get());
    }

    /**
     * Lists the objects that listen to this one. Nobody may remove listeners meanwhile.
     *
     * @return handles of them, first added first
     */
    std::vector<Object> listeners() const
    {
        std::vector<Object> all;
        for (ListenerGroupIterator at = ZlvGetListeners(get());
             ZlvListenerGroupIterHasNext(at) == 1; at = ZlvListenerGroupIterNext(at))
            all.push_back(adopt(ZlvListenerGroupIterGet(at)));
        return all;
    }

private:
    explicit Object(Handle handle) noexcept : Handle(std::move(handle)) {}
};

namespace detail {

/// The handle if its object is of KIND, else an empty one.
inline Object ofKind(Object object, uint32_t kind) noexcept
{
    if (object && object.get()->objClass->kind != kind)
        object.reset();
    return object;
}

} // namespace detail

/**
 * Holds a handler.
 *
 * @lock takes the API mutex, unless the handle is empty
 */
class Handler : public Object {
public:
    /** Holds nothing. */
    Handler() noexcept = default;

    /**
     * Gets the handler of that name, or creates it, as ZlvGetObject() does.
     *
     * @param name       object name; null gives none
     * @param className  class name; null for whatever class the object or its configuration has
     */
    explicit Handler(const char *name, const char *className = nullptr) noexcept
        : Handler(Object(name, className))
    {
    }

    /**
     * Takes over a handle.
     *
     * @param object  a handle of an object of another kind gives none
     */
    explicit Handler(Object object) noexcept
        : Object(detail::ofKind(std::move(object), ZLV_KIND_HANDLER))
    {
    }

    /**
     * Gives the formatter that this handler is bound to.
     *
     * @return a handle; an empty one when there is no formatter
     */
    Object formatter() const noexcept { return adopt(ZlvHandlerGetFormatter(get())); }

    /**
     * Binds this handler to a formatter.
     *
     * @param formatter  the formatter; an empty handle unbinds
     */
    void setFormatter(const Object &formatter) const noexcept
    {
        ZlvHandlerSetFormatter(get(), formatter.get());
    }
};

} // namespace v1
} // namespace zelvo

#endif

// SPDX-License-Identifier: Apache-2.0
/*
 * zelvo_config.hpp - owning handles of configurations. Part of the C++ layer; see zelvo.hpp.
 */
#ifndef ZELVO_CONFIG_HPP
#define ZELVO_CONFIG_HPP

#include "ZlvLogManager.h"
#include "ZlvObjConfig.h"
#include "zelvo_object.hpp"

namespace zelvo {
inline namespace v1 {

/**
 * Holds a reference to a configuration, or nothing. Copies hold references of their own.
 *
 * @lock takes the API mutex, unless the handle is empty
 */
class Config : public Handle<ZlvObjCfg, ZlvAcquireObjCfg, ZlvReleaseObjCfg> {
public:
    /** Holds nothing. */
    Config() noexcept = default;

    /**
     * Gets the configuration of that name from the log manager, which creates an empty one where
     * there is none.
     *
     * @param name  null or "/" gives none
     */
    explicit Config(const char *name) noexcept : Handle(ZlvLogMgrGetCfg(name)) {}

    /**
     * Takes over a reference of the caller's.
     *
     * @param config  the configuration; null for none
     * @return the handle
     * @lock none
     */
    static Config adopt(ZlvObjCfg *config) noexcept { return Config(Handle(config)); }

    /**
     * Tells whether a configuration of a name is registered. Creates nothing.
     *
     * @param name  null gives false
     * @return true if it is
     */
    static bool exists(const char *name) noexcept { return ZlvLogMgrHasCfg(name) == 1; }

    /**
     * Copies the configuration's name.
     *
     * @return the name; none for an empty handle
     */
    String name() const noexcept { return String(ZlvObjCfgGetName(get())); }

    /**
     * Tells whether the properties file made the configuration.
     *
     * @return true if it did
     */
    bool isFromFile() const noexcept { return ZlvObjCfgIsFromFile(get()) == 1; }

    /**
     * Gets the configuration's parent, which is created, empty, where it is not registered.
     *
     * @return the parent; an empty handle when there is none
     */
    Config parent() const noexcept { return adopt(ZlvObjCfgGetParent(get())); }

    /**
     * Reads a property, its own or inherited, as text.
     *
     * @param name  property name
     * @return the value; none when there is none
     */
    String property(const char *name) const noexcept
    {
        return String(ZlvGetInheritedObjCfgProp(get(), name, nullptr));
    }

    /**
     * Reads a property, its own or inherited, as bool, int32_t, int64_t, float or double.
     *
     * @param name  property name
     * @return the value; nothing when there is none or it does not convert
     */
    template <class T>
    std::optional<T> property(const char *name) const noexcept
    {
        return detail::read<T>(detail::pick<T>(ZlvGetObjCfgPropBool, ZlvGetObjCfgPropInt,
                                               ZlvGetObjCfgPropLong, ZlvGetObjCfgPropFloat,
                                               ZlvGetObjCfgPropDouble),
                               get(), name);
    }

    /**
     * Sets the configuration's own property. Objects that exist are told by applyTo().
     *
     * @param name   property name
     * @param value  text, copied; null removes the value, and readers go on to the parent
     */
    void setProperty(const char *name, const char *value) const noexcept
    {
        ZlvSetObjCfgProp(get(), name, value);
    }

    /**
     * Sets the configuration's own property to a bool, an int32_t, a float or a double.
     *
     * @param name   property name
     * @param value  stored as ZlvSetObjCfgPropBool() and its like do
     */
    template <class T, class = std::enable_if_t<!std::is_null_pointer_v<T>>>
    void setProperty(const char *name, T value) const noexcept
    {
        detail::set(detail::pickSetter<T>(ZlvSetObjCfgPropBool, ZlvSetObjCfgPropInt,
                                          ZlvSetObjCfgPropFloat, ZlvSetObjCfgPropDouble),
                    get(), name, value);
    }

    /**
     * Sets every property of this configuration and of its ancestors on an object, farthest
     * ancestor first. The log manager finds them by this configuration's name.
     *
     * @param object  the object
     * @return true when they were applied
     */
    bool applyTo(const Object &object) const noexcept
    {
        return ZlvLogMgrApplyCfg(object.get(), name().get()) == 1;
    }

    /** Takes the configuration out of the log manager, which gives its children to its parent. */
    void unregister() const noexcept { ZlvLogMgrRemCfg(get()); }

private:
    explicit Config(Handle handle) noexcept : Handle(std::move(handle)) {}
};

} // namespace v1
} // namespace zelvo

#endif

// SPDX-License-Identifier: Apache-2.0
/*
 * zelvo_handle.hpp - what the owning handles share: counting, and typed access to properties. Part
 * of the C++ layer; see zelvo.hpp.
 */
#ifndef ZELVO_HANDLE_HPP
#define ZELVO_HANDLE_HPP

#include <cstdint>
#include <optional>
#include <type_traits>
#include <utility>

#include "ZlvTypes.h"

namespace zelvo {
inline namespace v1 {

/**
 * Holds one counted reference, or nothing. A copy that cannot get a reference of its own holds
 * nothing.
 *
 * @tparam T        the record
 * @tparam acquire  adds a reference
 * @tparam giveBack gives one back
 * @lock none
 */
template <class T, T *(*acquire)(T *), void (*giveBack)(T *)>
class Handle {
public:
    /** Holds nothing. */
    Handle() noexcept = default;

    /**
     * Takes over a reference of the caller's.
     *
     * @param adopted  the record; null for none
     */
    explicit Handle(T *adopted) noexcept : record_(adopted) {}

    /**
     * Adds a reference.
     *
     * @param other  keeps its own
     * @lock takes the API mutex, unless the handle is empty
     */
    Handle(const Handle &other) noexcept
        : record_(other.record_ != nullptr ? acquire(other.record_) : nullptr)
    {
    }

    /**
     * Takes a reference over.
     *
     * @param other  is empty afterwards
     */
    Handle(Handle &&other) noexcept : record_(other.release()) {}

    /**
     * Gives the present reference back and takes another.
     *
     * @param other  moved or copied from
     * @return this handle
     * @lock takes the API mutex, unless both handles are empty
     */
    Handle &operator=(Handle other) noexcept
    {
        std::swap(record_, other.record_);
        return *this;
    }

    /**
     * Gives the reference back.
     *
     * @lock takes the API mutex, unless the handle is empty
     */
    ~Handle() { reset(); }

    /**
     * Gives the reference back; the handle is empty then.
     *
     * @lock takes the API mutex, unless the handle is empty
     */
    void reset() noexcept
    {
        if (T *record = release())
            giveBack(record);
    }

    /**
     * Hands the reference to the caller, who gives it back by the C call; the handle is empty then.
     *
     * @return the record, or null
     */
    T *release() noexcept { return std::exchange(record_, nullptr); }

    /**
     * Lends the record for C calls.
     *
     * @return the record, or null
     */
    T *get() const noexcept { return record_; }

    /** True when there is a record. */
    explicit operator bool() const noexcept { return record_ != nullptr; }

    /** True when both handles hold the same record, or none. */
    friend bool operator==(const Handle &a, const Handle &b) noexcept
    {
        return a.record_ == b.record_;
    }

    /** False when both handles hold the same record, or none. */
    friend bool operator!=(const Handle &a, const Handle &b) noexcept { return !(a == b); }

private:
    T *record_ = nullptr;
};

namespace detail {

template <class T>
inline constexpr bool isNoProperty =
    !std::is_same_v<T, bool> && !std::is_same_v<T, int32_t> && !std::is_same_v<T, int64_t> &&
    !std::is_same_v<T, float> && !std::is_same_v<T, double>;

/// The getter for properties of type T.
template <class T, class Bool, class Int, class Long, class Float, class Double>
constexpr auto pick(Bool asBool, Int asInt, Long asLong, Float asFloat, Double asDouble)
{
    static_assert(!isNoProperty<T>, "zelvo: a property is read as bool, int32_t, int64_t, float or "
                                    "double; for text write property(name)");
    if constexpr (std::is_same_v<T, bool>)
        return asBool;
    else if constexpr (std::is_same_v<T, int32_t>)
        return asInt;
    else if constexpr (std::is_same_v<T, int64_t>)
        return asLong;
    else if constexpr (std::is_same_v<T, float>)
        return asFloat;
    else
        return asDouble;
}

/// What a value is stored as: a constant of C, such as ZLV_LEVEL_INFO, is a number.
template <class T>
using StoredAs =
    std::conditional_t<std::is_enum_v<T> && std::is_convertible_v<T, int32_t>, int32_t, T>;

/// The setter for properties of type T. There is none for 64 bits, of which 32 would be stored.
template <class T, class Bool, class Int, class Float, class Double>
constexpr auto pickSetter(Bool asBool, Int asInt, Float asFloat, Double asDouble)
{
    using Stored = StoredAs<T>;
    static_assert(!isNoProperty<Stored> && !std::is_same_v<Stored, int64_t>,
                  "zelvo: a property is set to a bool, an int32_t, a float, a double or a "
                  "const char *; of 64 bits only 32 would be stored, so write those as text");
    return pick<Stored>(asBool, asInt, asInt, asFloat, asDouble);
}

/// Sets a property with the setter for its type.
template <class T, class Setter, class Record>
void set(Setter setter, Record *record, const char *name, T value) noexcept
{
    if constexpr (std::is_same_v<T, bool>)
        setter(record, name, value ? 1 : 0);
    else
        setter(record, name, static_cast<StoredAs<T>>(value));
}

/// Reads a property with the getter for its type.
template <class T, class Getter, class Record>
std::optional<T> read(Getter getter, Record *record, const char *name) noexcept
{
    ZlvBool found = 0;
    const auto value = getter(record, name, &found);
    return found == 1 ? std::optional<T>(static_cast<T>(value)) : std::nullopt;
}

} // namespace detail

} // namespace v1
} // namespace zelvo

#endif

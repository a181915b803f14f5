// SPDX-License-Identifier: Apache-2.0
// Follows ICU's default locale, zone and converter, which a program may change at any time. What is
// kept for one default must not be used under another.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstring>

namespace zelvo {

/// Gives a name a number that stays the same as long as the name does, and never comes back after
/// a change. A name too long to remember counts as changed each time.
template <class Unit, size_t SIZE>
class NumberedName {
public:
    uint64_t numberOf(const Unit *name, size_t length)
    {
        const bool isSame = number_ != 0 && length == length_ && length < SIZE &&
                            std::memcmp(name, name_, length * sizeof(Unit)) == 0;
        if (isSame)
            return number_;
        length_ = length;
        if (length < SIZE)
            std::memcpy(name_, name, length * sizeof(Unit));
        return ++number_;
    }

private:
    Unit name_[SIZE]{};
    size_t length_ = 0;
    uint64_t number_ = 0;
};

/// The default locale, for one owner who serialises its use.
class DefaultLocale {
public:
    /// The present one's number.
    uint64_t number();

private:
    NumberedName<char, 192> name_;
};

/// The default zone, for one owner who serialises its use.
class DefaultZone {
public:
    /// The present one's number. Zones are told apart by their identifiers.
    uint64_t number();

private:
    static constexpr int32_t CAPACITY = 128;

    NumberedName<char16_t, CAPACITY> name_;
};

/// The default converter, for one owner who serialises its use.
class DefaultConverter {
public:
    /// The present one's number.
    uint64_t number();

private:
    NumberedName<char, 64> name_;
};

} // namespace zelvo

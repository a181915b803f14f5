// SPDX-License-Identifier: Apache-2.0
/*
 * zelvo_text.hpp - strings that the library hands out, and the way between bytes and UTF-16. Part
 * of the C++ layer; see zelvo.hpp.
 */
#ifndef ZELVO_TEXT_HPP
#define ZELVO_TEXT_HPP

#include <memory>
#include <string>
#include <string_view>
#include <type_traits>

#include "CxMemory.h"
#include "CxUString.h"

namespace zelvo {
inline namespace v1 {

static_assert(std::is_same_v<UChar, char16_t>,
              "zelvo: the C++ layer wants ICU's UChar as char16_t");

namespace detail {

struct FreeMemory {
    void operator()(void *block) const noexcept { RkoMemoryFree(block); }
};

} // namespace detail

/**
 * Owns a string that ends with a zero, or none, and frees it with RkoMemoryFree(). It can be moved,
 * not copied.
 *
 * @tparam Unit  char for bytes in the code page, char16_t for UTF-16
 * @lock none
 */
template <class Unit>
class OwnedText {
public:
    /** Owns no string. */
    OwnedText() noexcept = default;

    /**
     * Takes over a string.
     *
     * @param text  a string that RkoMemoryFree() may free; null for none
     */
    explicit OwnedText(Unit *text) noexcept : text_(text) {}

    /**
     * Copies a text.
     *
     * @param text  need not end with a zero; a zero inside ends the copy for most readers
     * @return the copy; none when memory ran out
     */
    static OwnedText copyOf(std::basic_string_view<Unit> text) noexcept
    {
        auto *copy = static_cast<Unit *>(RkoMemoryMalloc((text.size() + 1) * sizeof(Unit)));
        if (copy != nullptr)
            copy[text.copy(copy, text.size())] = Unit{};
        return OwnedText(copy);
    }

    /**
     * Lends the string.
     *
     * @return the string, or null; valid as long as this owns it
     */
    const Unit *get() const noexcept { return text_.get(); }

    /**
     * Lends the string as a view.
     *
     * @return the text; the empty one when there is none
     */
    std::basic_string_view<Unit> view() const noexcept
    {
        return text_ ? std::basic_string_view<Unit>(text_.get()) : std::basic_string_view<Unit>();
    }

    /**
     * Hands the string to the caller.
     *
     * @return the string, which the caller frees with RkoMemoryFree(), or null
     */
    Unit *release() noexcept { return text_.release(); }

    /** True when there is a string, be it empty. */
    explicit operator bool() const noexcept { return text_ != nullptr; }

private:
    std::unique_ptr<Unit, detail::FreeMemory> text_;
};

/** A string of bytes in the code page. */
using String = OwnedText<char>;
/** A string of UTF-16. */
using UString = OwnedText<char16_t>;

/**
 * Makes UTF-16 of bytes, as an argument of a message wants it.
 *
 * @param bytes  text in the code page of ICU's default converter; null gives none
 * @return the text; none when memory ran out
 * @lock none
 */
inline UString utf16(const char *bytes) noexcept
{
    return UString(CxUStringDupStrToUChar(bytes));
}

/**
 * Makes UTF-16 of bytes, as an argument of a message wants it.
 *
 * @param bytes  text in the code page of ICU's default converter; ends at its first zero
 * @return the text; none when memory ran out
 * @lock none
 */
inline UString utf16(const std::string &bytes) noexcept
{
    return utf16(bytes.c_str());
}

/**
 * Makes bytes of UTF-16.
 *
 * @param text  null gives none
 * @return the text in the code page of ICU's default converter; none when memory ran out
 * @lock none
 */
inline String bytes(const char16_t *text) noexcept
{
    return String(CxUStringDupUCharToStr(text));
}

/**
 * Makes bytes of UTF-16.
 *
 * @param text  none gives none
 * @return the text in the code page of ICU's default converter; none when memory ran out
 * @lock none
 */
inline String bytes(const UString &text) noexcept
{
    return bytes(text.get());
}

} // namespace v1
} // namespace zelvo

#endif

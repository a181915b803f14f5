// SPDX-License-Identifier: Apache-2.0
/*
 * zelvo_arguments.hpp - the arguments of logging calls in C++, checked when they are compiled. Part
 * of the C++ layer; see zelvo.hpp.
 *
 * A message reads its arguments from a C argument list, with the types that its pattern tells:
 *
 *     {0}                 UTF-16 text: const char16_t *, std::u16string, std::u16string_view,
 *                         zelvo::UString
 *     {0,number,integer}  a signed integer of 32 bits, or one that becomes int unchanged (short,
 *                         unsigned short)
 *     {0,number}          double or float, which becomes double unchanged
 *     {0,date}, {0,time}  UDate, which is a double
 *
 * Every other type fails to compile, with a message that says what to write instead. The pattern
 * itself is not read: that each of its places has an argument, of the right one of these types, is
 * still the caller's word.
 *
 * A text ends at its first zero. A null pointer counts as the empty text, since a message with a
 * missing text cannot be bound. A std::u16string_view need not end with a zero: it is copied for a
 * call that is taken, and becomes the empty text when memory ran out.
 *
 * An argument may also be a callable without parameters that gives one of these types. It is called
 * only when the logger takes the level, before the call begins, so it may log itself.
 */
#ifndef ZELVO_ARGUMENTS_HPP
#define ZELVO_ARGUMENTS_HPP

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <type_traits>

#include "zelvo_text.hpp"

namespace zelvo {
inline namespace v1 {

namespace detail {

template <class T, class... Others>
inline constexpr bool isOneOf = (std::is_same_v<T, Others> || ...);

template <class T>
inline constexpr bool never = false;

#ifdef __cpp_char8_t
template <class T>
inline constexpr bool isUtf8Unit = std::is_same_v<T, char8_t>;
#else
template <class T>
inline constexpr bool isUtf8Unit = false;
#endif

template <class T>
inline constexpr bool isCharacter =
    isOneOf<T, char, signed char, unsigned char, wchar_t, char16_t, char32_t> || isUtf8Unit<T>;

template <class T>
inline constexpr bool isOtherInteger =
    std::is_integral_v<T> && !isCharacter<T> && !std::is_same_v<T, bool>;

/// What arrives in an argument list as the int32_t that it was.
template <class T>
inline constexpr bool isInteger = isOtherInteger<T> &&
                                  (std::is_signed_v<T> ? sizeof(T) <= sizeof(int32_t)
                                                       : sizeof(T) < sizeof(int32_t));

template <class T>
inline constexpr bool isBytes =
    isOneOf<T, const char *, char *, std::string, std::string_view, String>;

template <class T>
inline constexpr bool
    isOtherText = std::is_pointer_v<T> &&
                  (isOneOf<std::remove_cv_t<std::remove_pointer_t<T>>, wchar_t, char32_t> ||
                   isUtf8Unit<std::remove_cv_t<std::remove_pointer_t<T>>>);

/// Stops the compilation with the one message that helps for an argument of type T.
template <class T>
constexpr void refuse()
{
    static_assert(!std::is_same_v<T, bool>,
                  "zelvo: a message has no place for a bool; write flag ? 1 : 0 for "
                  "{0,number,integer}, or a text such as flag ? u\"yes\" : u\"no\" for {0}");
    static_assert(!std::is_null_pointer_v<T>,
                  "zelvo: a message has no place for nullptr; write u\"\" for an empty text");
    static_assert(!isCharacter<T>,
                  "zelvo: a message has no place for a single character or byte; write "
                  "std::u16string(1, c) for {0}, or static_cast<int32_t>(c) for its number");
    static_assert(!isOtherInteger<T>,
                  "zelvo: {0,number,integer} reads 32 bits with a sign; write "
                  "static_cast<int32_t>(n), or static_cast<double>(n) for {0,number}");
    static_assert(!std::is_same_v<T, long double>,
                  "zelvo: {0,number} reads a double; write static_cast<double>(x)");
    static_assert(!std::is_enum_v<T>,
                  "zelvo: a message has no place for an enumerator; write static_cast<int32_t>(e)");
    static_assert(!isBytes<T>,
                  "zelvo: texts of a message are UTF-16; write u\"text\", or zelvo::utf16(bytes) "
                  "for bytes in the code page");
    static_assert(!isOtherText<T>, "zelvo: texts of a message are UTF-16; write u\"text\"");
    static_assert(never<T>, "zelvo: an argument of a message is UTF-16 text, an int32_t or a "
                            "double, or a callable that gives one of them");
}

/// Holds a number that an argument list carries.
template <class T>
struct Number {
    T value;
    T raw() const noexcept { return value; }
};

/// Holds a text that somebody else owns.
struct LentText {
    const char16_t *text;
    const char16_t *raw() const noexcept { return text != nullptr ? text : u""; }
};

/// Holds a copy of a view, which ends with a zero.
struct CopiedText {
    UString text;
    const char16_t *raw() const noexcept { return LentText{text.get()}.raw(); }
};

template <class Arg>
auto passed(const Arg &arg);

/// Holds what a callable gave, and what an argument list carries for that.
template <class Callable>
struct Given {
    using Value = std::decay_t<std::invoke_result_t<const Callable &>>;

    explicit Given(const Callable &callable) : value(callable()), held(passed(value)) {}
    Given(const Given &) = delete;
    Given &operator=(const Given &) = delete;

    auto raw() const noexcept { return held.raw(); }

    Value value;
    decltype(passed(std::declval<const Value &>())) held;
};

/// Makes the holder of one argument, which lives until the call that it is made for returns.
template <class Arg>
auto passed(const Arg &arg)
{
    using T = std::decay_t<Arg>;
    if constexpr (std::is_invocable_v<const T &>)
        return Given<T>(arg);
    else if constexpr (isInteger<T>)
        return Number<int32_t>{arg};
    else if constexpr (isOneOf<T, float, double>)
        return Number<double>{arg};
    else if constexpr (isOneOf<T, const char16_t *, char16_t *>)
        return LentText{arg};
    else if constexpr (std::is_same_v<T, std::u16string>)
        return LentText{arg.c_str()};
    else if constexpr (std::is_same_v<T, UString>)
        return LentText{arg.get()};
    else if constexpr (std::is_same_v<T, std::u16string_view>)
        return CopiedText{UString::copyOf(arg)};
    else
        return refuse<T>(), Number<int32_t>{0};
}

} // namespace detail

} // namespace v1
} // namespace zelvo

#endif

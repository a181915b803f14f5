// SPDX-License-Identifier: Apache-2.0
/*
 * zelvo_pattern.hpp - the patterns of logging calls in C++, with their place in the source. Part of
 * the C++ layer; see zelvo.hpp.
 */
#ifndef ZELVO_PATTERN_HPP
#define ZELVO_PATTERN_HPP

#include <cstdint>
#include <string>
#include <type_traits>

#if __has_include(<version>)
#include <version>
#endif
#ifdef __cpp_lib_source_location
#include <source_location>
#endif

#include "ZlvTypes.h"

namespace zelvo {
inline namespace v1 {

class Pattern;

namespace detail {

/// What is neither taken as a pattern nor one already.
template <class T>
inline constexpr bool isNoPattern =
    !std::is_convertible_v<const T &, const char16_t *> && !std::is_same_v<T, std::u16string> &&
    !std::is_same_v<T, Pattern>;

template <class T>
inline constexpr bool alwaysFalse = false;

} // namespace detail

/**
 * The text of a call: a message pattern, which is lent, not copied.
 *
 * @lock none
 */
class Pattern {
public:
    /**
     * Takes a pattern.
     *
     * @param text  UTF-16 that ends with a zero; null leaves the event without text
     */
    Pattern(const char16_t *text) noexcept : text_(text) {}

    /**
     * Takes a pattern.
     *
     * @param text  ends at its first zero
     */
    Pattern(const std::u16string &text) noexcept : text_(text.c_str()) {}

    /**
     * Refuses everything else, when it is compiled.
     *
     * @param text  of another type
     */
    template <class T, class = std::enable_if_t<detail::isNoPattern<T>>>
    Pattern(const T &text) noexcept : text_(nullptr)
    {
        static_assert(detail::alwaysFalse<T>,
                      "zelvo: a pattern is UTF-16 text that ends with a zero; "
                      "write u\"text\" or a std::u16string");
        (void)text;
    }

    /**
     * Lends the pattern.
     *
     * @return the text, or null
     */
    const char16_t *text() const noexcept { return text_; }

private:
    const char16_t *text_;
};

/**
 * A pattern with the place in the source that it stands in, which the compiler fills in where a
 * pattern is passed: file and line, and the plain name of the function, without result and
 * parameters.
 *
 * @lock none
 */
class PlacedPattern {
public:
    /**
     * Takes a pattern; a place may be told instead of the present one.
     *
     * @param text      as the constructors of Pattern take it
     * @param file      source file; null leaves file and line out of the event
     * @param function  source function; null leaves it out of the event
     * @param line      source line
     */
    template <class T>
    PlacedPattern(const T &text, const char *file = __builtin_FILE(),
                  const char *function = __builtin_FUNCTION(), int32_t line = __builtin_LINE())
        : pattern_(text), file_(file), function_(function), line_(line)
    {
    }

#ifdef __cpp_lib_source_location
    /**
     * Takes a pattern and a place that a caller has handed on.
     *
     * @param pattern  the pattern
     * @param place    the place; its function is written as the compiler tells it, with parameters
     */
    PlacedPattern(const Pattern &pattern, const std::source_location &place) noexcept
        : pattern_(pattern), file_(place.file_name()), function_(place.function_name()),
          line_(static_cast<int32_t>(place.line()))
    {
    }
#endif

    /**
     * Lends the pattern.
     *
     * @return the text, or null
     */
    const char16_t *text() const noexcept
    {
        return pattern_.text();
    }

    /**
     * Tells the source file.
     *
     * @return the name, or null
     */
    const char *file() const noexcept
    {
        return file_;
    }

    /**
     * Tells the source function.
     *
     * @return the name, or null
     */
    const char *function() const noexcept
    {
        return function_;
    }

    /**
     * Tells the source line.
     *
     * @return the number
     */
    int32_t line() const noexcept
    {
        return line_;
    }

private:
    Pattern pattern_;
    const char *file_;
    const char *function_;
    int32_t line_;
};

} // namespace v1
} // namespace zelvo

#endif

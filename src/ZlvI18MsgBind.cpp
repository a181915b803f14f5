// SPDX-License-Identifier: Apache-2.0
// Binding a message: from its pattern and the arguments of the logging call to the final text.
//
// An argument list is consumed by reading it, and one list serves every handler of an event. So
// each run of the formatter reads a copy of its own, and a pattern without arguments none at all.
#include "ZlvI18MsgIntl.h"

#include <utility>

#include <unicode/uchar.h>
#include <unicode/ustring.h>

#include "ZlvApiMutex.h"
#include "ZlvBundlePattern.h"
#include "ZlvIcuText.h"
#include "ZlvMessageFormat.h"
#include "ZlvPlainPattern.h"

namespace zelvo {
namespace {

/// How many arguments a list of zeros can answer for.
constexpr int64_t ZERO_ARGUMENTS = 64;

UChar *formatted(ZlvI18Msg *message, const UChar *pattern, va_list args)
{
    const MessageFormat format{pattern, message->locale};
    if (format.get() == nullptr)
        return nullptr;
    UErrorCode status = U_ZERO_ERROR;
    UChar *text = icuText(
        [&](UChar *area, int32_t capacity, UErrorCode *error) {
            ArgList own{args};
            return umsg_vformat(format.get(), area, capacity, own.list, error);
        },
        &status);
    if (U_FAILURE(status))
        message->icuError = status;
    return text;
}

/// The argument number that follows a brace, cut at the limit; -1 if none follows. ICU allows white
/// space between the two.
int64_t argumentNumber(const UChar *text)
{
    while (u_hasBinaryProperty(*text, UCHAR_PATTERN_WHITE_SPACE))
        ++text;
    int64_t number = -1;
    for (; *text >= u'0' && *text <= u'9' && number < ZERO_ARGUMENTS; ++text)
        number = (number < 0 ? 0 : number * 10) + (*text - u'0');
    return number;
}

/// Tells whether the list of zeros holds every argument that a pattern can ask for. Quoted braces
/// count too: refusing such a pattern is safe, reading past the list is not.
bool zerosSuffice(const UChar *pattern)
{
    const UChar *brace = u_strchr(pattern, u'{');
    while (brace != nullptr && argumentNumber(brace + 1) < ZERO_ARGUMENTS)
        brace = u_strchr(brace + 1, u'{');
    return brace == nullptr;
}

UChar *formattedWithList(ZlvI18Msg *message, const UChar *pattern, ...)
{
    va_list zeros;
    va_start(zeros, pattern);
    UChar *text = formatted(message, pattern, zeros);
    va_end(zeros);
    return text;
}

/// Passes zeros of both register classes: eight doubles fill the floating-point registers, and the
/// integers, as wide as pointers and doubles, the rest and what is read from memory.
template <size_t... I, size_t... J>
UChar *formattedWithZeros(ZlvI18Msg *message, const UChar *pattern, std::index_sequence<I...>,
                          std::index_sequence<J...>)
{
    return formattedWithList(message, pattern, static_cast<double>(0 * I)...,
                             static_cast<uint64_t>(0 * J)...);
}

UChar *formattedWithZeros(ZlvI18Msg *message, const UChar *pattern)
{
    if (!zerosSuffice(pattern)) {
        message->icuError = U_ILLEGAL_ARGUMENT_ERROR;
        return nullptr;
    }
    return formattedWithZeros(message, pattern, std::make_index_sequence<8>{},
                              std::make_index_sequence<ZERO_ARGUMENTS>{});
}

/// Finds the message's pattern and gives what FORMAT makes of it.
template <class Format>
UChar *bind(ZlvI18Msg *message, Format format)
{
    if (message == nullptr)
        return nullptr;
    if (message->bundle == nullptr)
        return message->text != nullptr ? format(message->text) : nullptr;
    UErrorCode status = U_ZERO_ERROR;
    const BundlePattern pattern{message, &status};
    if (U_SUCCESS(status))
        return format(pattern.get());
    message->icuError = status;
    return nullptr;
}

} // namespace

UChar *zlvBindMsgWithZeros(ZlvI18Msg *message)
{
    return bind(message,
                [&](const UChar *pattern) { return formattedWithZeros(message, pattern); });
}

} // namespace zelvo

using namespace zelvo;

UChar *zlvIntlBindUI18Msg(ZlvI18Msg *message, va_list args)
{
    return bind(message, [&](const UChar *pattern) {
        const PlainPattern plain{pattern};
        if (plain.isPlain() && !plain.takesArguments())
            return plain.bind(nullptr, args);
        const bool takesNone = u_strchr(pattern, u'{') == nullptr;
        if (takesNone || isAbsent(args))
            return formattedWithZeros(message, pattern);
        const IntegerText *integers =
            plain.takesIntegers() ? integerText(message->locale) : nullptr;
        const bool isDirect = plain.isPlain() && (integers != nullptr || !plain.takesIntegers());
        return isDirect ? plain.bind(integers, args) : formatted(message, pattern, args);
    });
}

UChar *ZlvBindUI18Msg(ZlvI18Msg *message, va_list args)
{
    return locked(zlvIntlBindUI18Msg, message, args);
}

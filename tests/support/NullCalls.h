// SPDX-License-Identifier: Apache-2.0
// Runs a public call once for each of its pointer parameters, which is null then, while all other
// arguments are valid.
#pragma once

#include <cstdarg>
#include <functional>
#include <ostream>
#include <string>
#include <tuple>
#include <type_traits>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

#include "support/NullCallWorld.h"

namespace zelvo_test {

/// A public call and the answers that it must give, one character for each pointer parameter:
///     0  nothing: null, 0, false        1  1, true         <  -1
///     i  22, the number of EINVAL        N  no level        n  another number than 0
///     e  the status 'p' with code 22     -  the success status
///     f  new memory                      o  a new reference to an object   s  a new list
///     v  a new event                     m  a new message   l  something lent, or a record in use
///     .  no result                       x  not called: must not be null, says its contract,
///                                     or a test of its own does it
struct NullCall {
    const char *name;
    const char *answers;
    std::function<void(char answer, size_t position)> run;
    size_t pointers;
};

inline void PrintTo(const NullCall &call, std::ostream *out)
{
    *out << call.name << " \"" << call.answers << '"';
}

/// The number that an answer stands for.
inline int numberOf(char answer)
{
    switch (answer) {
    case '<':
        return -1;
    case 'i':
        return 22;
    case 'N':
        return ZLV_LEVEL_NONE;
    default:
        EXPECT_TRUE(answer == '0' || answer == '1') << answer;
        return answer - '0';
    }
}

/// Checks RESULT against ANSWER and frees what came new.
template <class Result>
void checkAnswer(const Result &result, char answer)
{
    if constexpr (std::is_same_v<Result, CxStatus>) {
        EXPECT_EQ(result.type, answer == 'e' ? CX_STATUS_PLATFORM : CX_STATUS_OK);
        EXPECT_EQ(result.code, answer == 'e' ? 22 : 0);
    } else if constexpr (std::is_same_v<Result, ZlvStatus>) {
        EXPECT_EQ(answer, '-');
        EXPECT_EQ(result.type, CX_STATUS_OK);
        EXPECT_EQ(result.code, 0);
    } else if constexpr (std::is_pointer_v<Result>) {
        EXPECT_EQ(result == nullptr, answer == '0') << "answer " << answer;
        release(result, answer);
    } else if constexpr (std::is_arithmetic_v<Result>) {
        if (answer == 'n')
            EXPECT_NE(result, Result{});
        else
            EXPECT_EQ(result, static_cast<Result>(numberOf(answer)));
    } else {
        EXPECT_EQ(isEmpty(result), answer == '0') << "answer " << answer;
    }
}

/// Calls FUNCTION with ARGUMENTS; a variadic one gets no further arguments.
template <class Function, class... Parameters>
void callAndCheck(Function function, std::tuple<Parameters...> arguments, char answer)
{
    using Result = decltype(std::apply(function, arguments));
    if constexpr (std::is_void_v<Result>) {
        EXPECT_EQ(answer, '.');
        std::apply(function, arguments);
    } else {
        checkAnswer(std::apply(function, arguments), answer);
    }
}

/// Sets the pointer parameter number POSITION of ARGUMENTS to null.
template <class... Parameters>
void nullify(std::tuple<Parameters...> &arguments, size_t position)
{
    size_t seen = 0;
    auto visit = [&](auto &argument) {
        if constexpr (std::is_pointer_v<std::remove_reference_t<decltype(argument)>>)
            if (seen++ == position)
                argument = nullptr;
    };
    std::apply([&](auto &...argument) { (visit(argument), ...); }, arguments);
}

template <class... Parameters>
NullCall nullCall(const char *name, const char *answers, Kind kind, auto function)
{
    auto run = [function, kind](char answer, size_t position) {
        NullCallWorld world(kind);
        withArgs(
            [&](va_list args) {
                world.args = args;
                std::tuple<Parameters...> arguments{world.sample<Parameters>()...};
                nullify(arguments, position);
                callAndCheck(function, arguments, answer);
            },
            "first", "second");
    };
    return {name, answers, run, (size_t{std::is_pointer_v<Parameters>} + ... + 0)};
}

template <class Result, class... Parameters>
NullCall makeNullCall(const char *name, const char *answers, Kind kind,
                      Result (*function)(Parameters...))
{
    return nullCall<Parameters...>(name, answers, kind, function);
}

template <class Result, class... Parameters>
NullCall makeNullCall(const char *name, const char *answers, Kind kind,
                      Result (*function)(Parameters..., ...))
{
    return nullCall<Parameters...>(name, answers, kind, function);
}

/// The calls of the portability layer, of the containers and of the toolkit.
std::vector<NullCall> portabilityNullCalls();
std::vector<NullCall> containerNullCalls();
std::vector<NullCall> toolkitNullCalls();
/// Those of the file handlers and of problem determination.
std::vector<NullCall> classNullCalls();

} // namespace zelvo_test

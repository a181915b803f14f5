// SPDX-License-Identifier: Apache-2.0
// The Unicode library's process-wide defaults, changed for the length of a test.
#pragma once

#include <string>

#include <gtest/gtest.h>
#include <unicode/ucnv.h>
#include <unicode/uloc.h>

namespace zelvo_test {

/// While one lives, bytes are converted by the converter named. Builds of the Unicode library whose
/// default is always UTF-8 know no other, so tests ask for that one.
class DefaultConverter {
public:
    explicit DefaultConverter(const char *name) : before_(ucnv_getDefaultName())
    {
        ucnv_setDefaultName(name);
    }
    DefaultConverter(const DefaultConverter &) = delete;
    DefaultConverter &operator=(const DefaultConverter &) = delete;
    ~DefaultConverter() { ucnv_setDefaultName(before_.c_str()); }

private:
    std::string before_;
};

/// While one lives, the default locale is the one named.
class DefaultLocale {
public:
    explicit DefaultLocale(const char *name) : before_(uloc_getDefault()) { set(name); }
    DefaultLocale(const DefaultLocale &) = delete;
    DefaultLocale &operator=(const DefaultLocale &) = delete;
    ~DefaultLocale() { set(before_.c_str()); }

private:
    static void set(const char *name)
    {
        UErrorCode error = U_ZERO_ERROR;
        uloc_setDefault(name, &error);
        EXPECT_TRUE(U_SUCCESS(error)) << name << ": " << u_errorName(error);
    }

    std::string before_;
};

} // namespace zelvo_test

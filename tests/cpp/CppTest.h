// SPDX-License-Identifier: Apache-2.0
// A fixture for the C++ layer, which knows the public headers and the shared library only.
#pragma once

#include <string>
#include <vector>

#include <gtest/gtest.h>
#include <unicode/uloc.h>

#include "zelvo.hpp"

namespace zelvo_test {

/// An open toolkit with the logger "app", whose one listener keeps what it gets.
class CppTest : public testing::Test {
protected:
    void SetUp() override
    {
        ASSERT_TRUE(toolkit_);
        UErrorCode status = U_ZERO_ERROR;
        uloc_setDefault("en_US", &status);
        app_.addListener(memory_);
        app_.setProperty("level", "ALL");
    }

    /// The text of the newest event.
    std::u16string text() const
    {
        const auto event = memory_.last();
        return event ? event->text : u"(no event)";
    }

    /// A property of the newest event.
    std::string property(const char *name) const
    {
        const auto event = memory_.last();
        const std::string *value = event ? event->property(name) : nullptr;
        return value != nullptr ? *value : "(none)";
    }

    zelvo::Toolkit toolkit_;
    zelvo::Logger app_{"app", "zlv_basiclogger"};
    zelvo::MemoryHandler memory_{"memory"};
};

} // namespace zelvo_test

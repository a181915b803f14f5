// SPDX-License-Identifier: Apache-2.0
// Runs the unit tests. A suite is one process, so what a test changes process-wide is put back when
// it ends, and the next one starts as if it were alone.
#include <clocale>
#include <string>

#include <gtest/gtest.h>
#include <unicode/ucal.h>
#include <unicode/uloc.h>

namespace {

/// Restores the defaults of the C library and of the Unicode library after each test.
class DefaultsRestored : public testing::EmptyTestEventListener {
public:
    DefaultsRestored()
    {
        UErrorCode error = U_ZERO_ERROR;
        ucal_getDefaultTimeZone(zone_, ZONE_LENGTH, &error);
    }

private:
    void OnTestEnd(const testing::TestInfo & /*test*/) override
    {
        UErrorCode error = U_ZERO_ERROR;
        std::setlocale(LC_ALL, "C");
        uloc_setDefault(locale_.c_str(), &error);
        ucal_setDefaultTimeZone(zone_, &error);
        EXPECT_TRUE(U_SUCCESS(error)) << u_errorName(error);
    }

    std::string locale_ = uloc_getDefault();
    static constexpr int32_t ZONE_LENGTH = 64;
    UChar zone_[ZONE_LENGTH] = {};
};

} // namespace

int main(int argc, char **argv)
{
    testing::InitGoogleTest(&argc, argv);
    testing::UnitTest::GetInstance()->listeners().Append(new DefaultsRestored);
    return RUN_ALL_TESTS();
}

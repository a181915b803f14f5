// SPDX-License-Identifier: Apache-2.0
// The formats are kept between numbers. Buffers are used without any lock, so the kept formats have
// one of their own. Whoever finds it taken opens a format for himself instead of waiting: a child
// process could wait for ever for a thread that it does not have.
#include "CxNumberText.h"

#include <cmath>
#include <cstring>
#include <pthread.h>

#include <unicode/umsg.h>
#include <unicode/ustring.h>

#include "CxDecimal.h"
#include "CxIcuDefaults.h"

namespace zelvo {
namespace {

const UChar *patternOf(NumberForm form)
{
    return form == NumberForm::WHOLE ? u"{0,number,#}" : u"{0,number,#.#####}";
}

UMessageFormat *openFormat(NumberForm form, UErrorCode *status)
{
    return umsg_open(patternOf(form), -1, nullptr, nullptr, status);
}

bool formatNumber(const UMessageFormat *format, double value, NumberText &result)
{
    UErrorCode status = U_ZERO_ERROR;
    const int32_t length = umsg_format(format, result.text, NumberText::SIZE, &status, value);
    return U_SUCCESS(status) && length > 0 && length < NumberText::SIZE;
}

bool writeFromScratch(NumberForm form, double value, NumberText &result)
{
    UErrorCode status = U_ZERO_ERROR;
    UMessageFormat *format = openFormat(form, &status);
    const bool isWritten = U_SUCCESS(status) && formatNumber(format, value, result);
    umsg_close(format);
    return isWritten;
}

/// Numbers that an integer holds exactly, and that no locale writes with more than digits.
bool isPlainInteger(double value)
{
    return value >= 0 && value < 1e15 && std::floor(value) == value && !std::signbit(value);
}

void writeDigits(double value, NumberText &result)
{
    const DecimalText digits = decimalText(static_cast<int64_t>(value));
    u_charsToUChars(digits.text, result.text, DecimalText::SIZE);
}

bool isWrittenInDigits(const UMessageFormat *format, double sample)
{
    NumberText expected;
    NumberText written;
    writeDigits(sample, expected);
    return formatNumber(format, sample, written) && u_strcmp(written.text, expected.text) == 0;
}

/// The kept format of one form.
class KeptFormat {
public:
    explicit constexpr KeptFormat(NumberForm form) : form_(form) {}

    bool write(double value, NumberText &result)
    {
        const uint64_t locale = locale_.number();
        if (format_ == nullptr || opened_ != locale)
            reopen(locale);
        if (format_ == nullptr)
            return false;
        if (!hasPlainDigits_ || !isPlainInteger(value))
            return formatNumber(format_, value, result);
        writeDigits(value, result);
        return true;
    }

    void drop()
    {
        umsg_close(format_);
        format_ = nullptr;
    }

private:
    void reopen(uint64_t locale)
    {
        drop();
        UErrorCode status = U_ZERO_ERROR;
        format_ = openFormat(form_, &status);
        if (U_FAILURE(status))
            return drop();
        opened_ = locale;
        // All ten digits, at odd places and at even ones.
        hasPlainDigits_ = isWrittenInDigits(format_, 0) &&
                          isWrittenInDigits(format_, 1234567890123) &&
                          isWrittenInDigits(format_, 12345678901234);
    }

    NumberForm form_;
    UMessageFormat *format_ = nullptr;
    DefaultLocale locale_;
    uint64_t opened_ = 0;
    bool hasPlainDigits_ = false;
};

pthread_mutex_t lock = PTHREAD_MUTEX_INITIALIZER;
constinit KeptFormat wholeFormat{NumberForm::WHOLE};
constinit KeptFormat fractionFormat{NumberForm::FRACTION};

bool writeKept(NumberForm form, double value, NumberText &result)
{
    if (ZELVO_KEEP == 0 || pthread_mutex_trylock(&lock) != 0)
        return false;
    KeptFormat &kept = form == NumberForm::WHOLE ? wholeFormat : fractionFormat;
    const bool isWritten = kept.write(value, result);
    pthread_mutex_unlock(&lock);
    return isWritten;
}

} // namespace

bool writeNumber(NumberForm form, double value, NumberText &result)
{
    return writeKept(form, value, result) || writeFromScratch(form, value, result);
}

void dropKeptNumberFormats()
{
    if (pthread_mutex_trylock(&lock) != 0)
        return;
    wholeFormat.drop();
    fractionFormat.drop();
    pthread_mutex_unlock(&lock);
}

} // namespace zelvo

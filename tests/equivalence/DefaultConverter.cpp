// SPDX-License-Identifier: Apache-2.0
// A default converter that can be changed. Builds of ICU for Linux are mostly made for UTF-8 alone,
// and changing it does nothing there; so the linker gives these functions of the program to the
// library in place of ICU's.
#include <string>

#include <unicode/ucnv.h>
#include <unicode/ustring.h>

namespace {

constexpr int32_t NO_LIMIT = 0x0FFFFFFF;

std::string defaultName = "UTF-8";

/// A converter for one conversion.
class Converter {
public:
    Converter() : converter_(ucnv_open(defaultName.c_str(), &status)) {}
    Converter(const Converter &) = delete;
    Converter &operator=(const Converter &) = delete;
    ~Converter() { ucnv_close(converter_); }

    UConverter *get() const { return converter_; }

    UErrorCode status = U_ZERO_ERROR;

private:
    UConverter *converter_;
};

} // namespace

extern "C" const char *ucnv_getDefaultName()
{
    return defaultName.c_str();
}

extern "C" void ucnv_setDefaultName(const char *name)
{
    defaultName = name;
}

extern "C" UChar *u_uastrcpy(UChar *to, const char *from)
{
    Converter converter;
    const auto length = static_cast<int32_t>(std::char_traits<char>::length(from));
    ucnv_toUChars(converter.get(), to, NO_LIMIT, from, length, &converter.status);
    return to;
}

extern "C" char *u_austrcpy(char *to, const UChar *from)
{
    Converter converter;
    const int32_t length =
        ucnv_fromUChars(converter.get(), to, NO_LIMIT, from, -1, &converter.status);
    to[length] = '\0';
    return to;
}

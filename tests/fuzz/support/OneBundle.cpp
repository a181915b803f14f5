// SPDX-License-Identifier: Apache-2.0
#include "support/OneBundle.h"

#include <functional>

#include <unicode/ures.h>

namespace {

std::u16string currentPattern;
std::string currentKey;

} // namespace

void zelvo_fuzz::setBundlePattern(const std::u16string &pattern)
{
    currentPattern = pattern;
    currentKey = "key" + std::to_string(std::hash<std::u16string>{}(pattern));
}

const std::string &zelvo_fuzz::bundleKey()
{
    return currentKey;
}

// The names are the linker's: these answer for ICU wherever the library asks for a bundle.
// NOLINTBEGIN(bugprone-reserved-identifier, cert-dcl37-c, cert-dcl51-cpp)
extern "C" {
UResourceBundle *U_ICU_ENTRY_POINT_RENAME(__wrap_ures_open)(const char *, const char *,
                                                            UErrorCode *);
const UChar *U_ICU_ENTRY_POINT_RENAME(__wrap_ures_getStringByKey)(const UResourceBundle *,
                                                                  const char *, int32_t *,
                                                                  UErrorCode *);
void U_ICU_ENTRY_POINT_RENAME(__wrap_ures_close)(UResourceBundle *);

UResourceBundle *U_ICU_ENTRY_POINT_RENAME(__wrap_ures_open)(const char *, const char *,
                                                            UErrorCode *)
{
    return nullptr;
}
const UChar *U_ICU_ENTRY_POINT_RENAME(__wrap_ures_getStringByKey)(const UResourceBundle *,
                                                                  const char *, int32_t *length,
                                                                  UErrorCode *)
{
    *length = static_cast<int32_t>(currentPattern.size());
    return currentPattern.c_str();
}
void U_ICU_ENTRY_POINT_RENAME(__wrap_ures_close)(UResourceBundle *) {}
}
// NOLINTEND(bugprone-reserved-identifier, cert-dcl37-c, cert-dcl51-cpp)

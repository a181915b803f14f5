// SPDX-License-Identifier: Apache-2.0
// Tests of single bytes. A char may be signed or not; comparing it with ASCII characters works out
// alike, since bytes from 0x80 on fall outside every range either way.
#include "CxChars.h"

#include <string_view>

static bool isWithin(char c, char first, char last)
{
    return first <= c && c <= last;
}

ZlvBool CxIsASCIIDigit(char c)
{
    return isWithin(c, 0x30, 0x39);
}

ZlvBool CxIsASCIIAlpha(char c)
{
    return isWithin(c, 0x41, 0x5A) || isWithin(c, 0x61, 0x7A);
}

ZlvBool CxIsLocalDigit(char c)
{
    return std::string_view("0123456789").find(c) != std::string_view::npos;
}

void CxETOA(char * /*buffer*/, size_t /*length*/)
{
    // Text of this build is ASCII already.
}

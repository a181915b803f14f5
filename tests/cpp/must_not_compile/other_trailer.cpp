// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: trailer is zelvo::String trailer(zelvo::Self) noexcept
#include "zelvo_class.hpp"

class Own {
public:
#ifdef FAULT_REMOVED
    zelvo::String trailer(zelvo::Self) noexcept
    {
        return {};
    }
#else
    zelvo::UString trailer(zelvo::Self) noexcept
    {
        return {};
    }
#endif
    zelvo::UString format(zelvo::Self, zelvo::Event) noexcept
    {
        return {};
    }
};

void add();

void add()
{
    zelvo::addFormatterClass<Own>("own");
}

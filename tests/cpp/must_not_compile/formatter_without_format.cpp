// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: a formatter class needs a public member zelvo::UString format(zelvo::Self,
// zelvo::Event) noexcept
#include "zelvo_class.hpp"

class Own {
public:
#ifdef FAULT_REMOVED
    zelvo::UString format(zelvo::Self, zelvo::Event) noexcept
    {
        return {};
    }
#else
    std::u16string format(zelvo::Self, zelvo::Event) noexcept
    {
        return {};
    }
#endif
};

void add();

void add()
{
    zelvo::addFormatterClass<Own>("own");
}

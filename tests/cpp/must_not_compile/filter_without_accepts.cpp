// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: a filter class needs a public member bool accepts(zelvo::Self, zelvo::Event)
// noexcept
#include "zelvo_class.hpp"

class Own {
public:
#ifdef FAULT_REMOVED
    bool accepts(zelvo::Self, zelvo::Event) noexcept
    {
        return true;
    }
#else
    void accepts(zelvo::Self, zelvo::Event) noexcept {}
#endif
};

void add();

void add()
{
    zelvo::addFilterClass<Own>("own");
}

// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: configure is bool configure(zelvo::Self, const char *) noexcept
#include "zelvo_class.hpp"

class Own {
public:
#ifdef FAULT_REMOVED
    bool configure(zelvo::Self, const char *) noexcept
    {
        return false;
    }
#else
    void configure(zelvo::Self, const char *) noexcept {}
#endif
    void process(zelvo::Self, zelvo::Event) noexcept {}
};

void add();

void add()
{
    zelvo::addHandlerClass<Own>("own");
}

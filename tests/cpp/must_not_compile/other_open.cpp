// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: open is void open(zelvo::Self) noexcept
#include "zelvo_class.hpp"

class Own {
public:
#ifdef FAULT_REMOVED
    void open(zelvo::Self) noexcept {}
#else
    void open(const char *) noexcept {}
#endif
    void process(zelvo::Self, zelvo::Event) noexcept {}
};

void add();

void add()
{
    zelvo::addHandlerClass<Own>("own");
}

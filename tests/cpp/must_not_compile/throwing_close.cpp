// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: close is void close(zelvo::Self) noexcept
#include "zelvo_class.hpp"

class Own {
public:
#ifdef FAULT_REMOVED
    void close(zelvo::Self) noexcept {}
#else
    void close(zelvo::Self) {}
#endif
    void process(zelvo::Self, zelvo::Event) noexcept {}
};

void add();

void add()
{
    zelvo::addHandlerClass<Own>("own");
}

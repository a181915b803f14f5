// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: a handler class needs a public member void process(zelvo::Self, zelvo::Event)
// noexcept
#include "zelvo_class.hpp"

class Own {
public:
#ifdef FAULT_REMOVED
    void process(zelvo::Self, zelvo::Event) noexcept {}
#else
    void proces(zelvo::Self, zelvo::Event) noexcept {}
#endif
};

void add();

void add()
{
    zelvo::addHandlerClass<Own>("own");
}

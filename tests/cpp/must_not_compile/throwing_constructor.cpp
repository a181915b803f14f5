// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: a class of one's own is made without arguments, by a constructor that is noexcept
#include "zelvo_class.hpp"

class Own {
public:
#ifdef FAULT_REMOVED
    Own() noexcept {}
#else
    Own() {}
#endif
    void process(zelvo::Self, zelvo::Event) noexcept {}
};

void add();

void add()
{
    zelvo::addHandlerClass<Own>("own");
}

// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: a class of one's own is stored as malloc() aligns memory
#include "zelvo_class.hpp"

class Own {
public:
#ifdef FAULT_REMOVED
    alignas(std::max_align_t) char buffer[64] = {};
#else
    alignas(64) char buffer[64] = {};
#endif
    void process(zelvo::Self, zelvo::Event) noexcept {}
};

void add();

void add()
{
    zelvo::addHandlerClass<Own>("own");
}

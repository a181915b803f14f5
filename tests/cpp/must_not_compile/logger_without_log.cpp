// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: a logger class needs a public member void log(zelvo::Self, zelvo::Event) noexcept
#include "zelvo_class.hpp"

class Own {
public:
#ifdef FAULT_REMOVED
    void log(zelvo::Self, zelvo::Event) noexcept {}
#else
    void log(zelvo::Event) noexcept {}
#endif
};

void add();

void add()
{
    zelvo::addLoggerClass<Own>("own");
}

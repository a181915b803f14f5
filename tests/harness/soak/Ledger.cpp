// SPDX-License-Identifier: Apache-2.0
#include "Ledger.h"

#include <gtest/gtest.h>

#include <sys/mman.h>

namespace zelvo_test {

Ledger::Ledger(uint32_t capacity)
    : capacity_(capacity), area_(mmap(nullptr, size(), PROT_READ | PROT_WRITE,
                                      MAP_SHARED | MAP_ANONYMOUS | MAP_NORESERVE, -1, 0))
{
    if (area_ == MAP_FAILED)
        ADD_FAILURE() << "no shared memory of " << size() << " bytes";
}

Ledger::~Ledger()
{
    munmap(area_, size());
}

Fate *Ledger::entry(uint32_t stream, uint32_t number) const
{
    auto *entries = static_cast<Fate *>(area_) + sizeof(Board);
    return entries + size_t{stream} * capacity_ + number - 1;
}

void Ledger::end(uint32_t stream, uint32_t number, Fate fate)
{
    *entry(stream, number) = fate;
    if (fate == Fate::ACKNOWLEDGED)
        ++this->stream(stream).acknowledged;
    if (fate == Fate::REFUSED)
        ++this->stream(stream).refused;
}

} // namespace zelvo_test

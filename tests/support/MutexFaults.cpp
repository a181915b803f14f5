// SPDX-License-Identifier: Apache-2.0
#include "support/MutexFaults.h"

#include "CxMutex.h"

namespace zelvo_test {
namespace {
MutexFaults *faults = nullptr;
}

MutexFaults::MutexFaults()
{
    faults = this;
}

MutexFaults::~MutexFaults()
{
    faults = nullptr;
}

MutexFaults *MutexFaults::current()
{
    return faults;
}

} // namespace zelvo_test

using zelvo_test::MutexFaults;

// The names are the linker's: --wrap=f sends calls of f to __wrap_f and names the real one
// __real_f. NOLINTBEGIN(bugprone-reserved-identifier, cert-dcl37-c, cert-dcl51-cpp)
extern "C" {
CxStatus __real_CxMutexCreate(CxMutex *slot);
CxStatus __real_CxMutexDestroy(CxMutex *slot);
CxStatus __wrap_CxMutexCreate(CxMutex *slot);
CxStatus __wrap_CxMutexDestroy(CxMutex *slot);

CxStatus __wrap_CxMutexCreate(CxMutex *slot)
{
    MutexFaults *faults = MutexFaults::current();
    if (faults != nullptr && faults->createCode != 0)
        return CxStatus{CX_STATUS_PLATFORM, faults->createCode};
    return __real_CxMutexCreate(slot);
}

CxStatus __wrap_CxMutexDestroy(CxMutex *slot)
{
    MutexFaults *faults = MutexFaults::current();
    CxStatus status = __real_CxMutexDestroy(slot);
    if (faults != nullptr && faults->destroyCode != 0)
        return CxStatus{CX_STATUS_PLATFORM, faults->destroyCode};
    return status;
}
}
// NOLINTEND(bugprone-reserved-identifier, cert-dcl37-c, cert-dcl51-cpp)

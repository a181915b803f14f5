// SPDX-License-Identifier: Apache-2.0
// Owners of what a public call holds while it runs: the API mutex, and references to objects and
// configurations.
#pragma once

#include "ZlvIntl.h"

namespace zelvo {

/// Holds the API mutex from construction to destruction, if it could be taken.
class ApiLock {
public:
    ApiLock() : held_(zlvAPIMutexLock() == 1) {}
    ApiLock(const ApiLock &) = delete;
    ApiLock &operator=(const ApiLock &) = delete;
    ~ApiLock()
    {
        if (held_)
            zlvAPIMutexUnlock();
    }

    explicit operator bool() const { return held_; }

private:
    bool held_;
};

/// Holds one counted reference and gives it back with RELEASE.
template <class T, void (*RELEASE)(T *)>
class Reference {
public:
    /// Takes over a reference that the caller holds.
    explicit Reference(T *record) : record_(record) {}
    Reference(const Reference &) = delete;
    Reference &operator=(const Reference &) = delete;
    ~Reference() { RELEASE(record_); }

    T *get() const { return record_; }
    T *operator->() const { return record_; }
    explicit operator bool() const { return record_ != nullptr; }

    /// Hands the reference to the caller.
    T *take()
    {
        T *record = record_;
        record_ = nullptr;
        return record;
    }

private:
    T *record_;
};

using ObjectRef = Reference<ZlvObject, zlvIntlReleaseObject>;
using CfgRef = Reference<ZlvObjCfg, zlvIntlReleaseObjCfg>;

} // namespace zelvo

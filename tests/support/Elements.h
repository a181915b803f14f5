// SPDX-License-Identifier: Apache-2.0
// Three samples, 'a', 'b' and 'c', of each kind of element that containers hold, so that the rules
// which all families share are tested in one place. A kind says how a sample is given to a
// container, which sample a stored element is, and how to let go of one that was handed out.
#pragma once

#include <array>
#include <string>

#include "CxMemory.h"
#include "CxString.h"
#include "ZlvObjClass.h"
#include "ZlvObjConfig.h"
#include "ZlvObject.h"
#include "ZlvParm.h"
#include "ZlvToolkitIntl.h"

namespace zelvo_test {

/// Holds the API mutex, as the callers of internal forms do.
class HeldMutex {
public:
    HeldMutex() { zlvAPIMutexLock(); }
    HeldMutex(const HeldMutex &) = delete;
    HeldMutex &operator=(const HeldMutex &) = delete;
    ~HeldMutex() { zlvAPIMutexUnlock(); }
};

/// What callers of public forms hold.
struct NoMutex {};

struct StringElements {
    static const char *give(char letter)
    {
        static constexpr const char *samples[] = {"a", "b", "c"};
        return samples[letter - 'a'];
    }
    static char letter(const char *stored) { return RkoStringLen(stored) == 1 ? stored[0] : '?'; }
    static void letGo(char *handedOut) { RkoMemoryFree(handedOut); }
};

/// One sample with a string of its own, the others of two sizes of number.
struct ParmElements {
    static const ZlvParm *give(char letter)
    {
        static char text[] = "text";
        static const ZlvParm samples[] = {{ZLV_PARM_INT, {.intValue = 7}},
                                          {ZLV_PARM_STRING, {.stringValue = text}},
                                          {ZLV_PARM_DOUBLE, {.doubleValue = 2.5}}};
        return &samples[letter - 'a'];
    }
    static char letter(const ZlvParm *stored)
    {
        for (char each : std::string("abc"))
            if (ZlvCmpParms(stored, give(each)) == 1)
                return each;
        return '?';
    }
    static void letGo(ZlvParm *handedOut) { ZlvFreeParm(handedOut); }
};

/// Records of the test's own, without a life in the toolkit. Where they are counted, their counts
/// start far above every threshold, so that nothing is ever destroyed.
template <class Record>
struct RecordElements {
    std::array<Record, 3> samples{};

    Record *give(char letter) { return &samples[static_cast<size_t>(letter - 'a')]; }
    char letter(const Record *stored)
    {
        for (char each : std::string("abc"))
            if (stored == give(each))
                return each;
        return '?';
    }
};

template <class Record>
struct CountedElements : RecordElements<Record> {
    static constexpr uint32_t COUNT_AT_START = 10;

    CountedElements()
    {
        for (Record &sample : this->samples)
            sample.refCount = COUNT_AT_START;
    }
    /// The references that containers and the test hold to a sample.
    uint32_t references(char letter) { return this->give(letter)->refCount - COUNT_AT_START; }
    static void letGo(Record *handedOut) { --handedOut->refCount; }
};

struct ObjectElements : CountedElements<ZlvObject> {
    ZlvObjClass objectClass{};

    ObjectElements()
    {
        objectClass.kind = ZLV_KIND_LOGGER;
        for (ZlvObject &sample : samples)
            sample.objClass = &objectClass;
    }
};

using CfgElements = CountedElements<ZlvObjCfg>;

struct ClassElements : RecordElements<ZlvObjClass> {
    static void letGo(ZlvObjClass *) {}
};

} // namespace zelvo_test

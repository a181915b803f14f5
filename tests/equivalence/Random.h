// SPDX-License-Identifier: Apache-2.0
// Numbers that look random and depend on a seed alone.
#pragma once

#include <cstddef>
#include <cstdint>

namespace zelvo_equivalence {

class Random {
public:
    explicit Random(uint64_t seed) : state_(seed) {}

    uint64_t next()
    {
        state_ += 0x9E3779B97F4A7C15;
        uint64_t bits = state_;
        bits = (bits ^ (bits >> 30)) * 0xBF58476D1CE4E5B9;
        bits = (bits ^ (bits >> 27)) * 0x94D049BB133111EB;
        return bits ^ (bits >> 31);
    }

    /// From 0 to LIMIT - 1.
    uint32_t below(size_t limit) { return static_cast<uint32_t>(next() % limit); }

    bool oneIn(uint32_t times) { return below(times) == 0; }

    template <class T, size_t COUNT>
    const T &of(const T (&choices)[COUNT])
    {
        return choices[below(COUNT)];
    }

private:
    uint64_t state_;
};

} // namespace zelvo_equivalence

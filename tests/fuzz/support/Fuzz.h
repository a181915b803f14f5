// SPDX-License-Identifier: Apache-2.0
// What the fuzz targets share: claims about results, the fault that is seeded for the control, and
// inputs taken apart.
#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <memory>
#include <string>
#include <string_view>

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size);

namespace zelvo_fuzz {

/// Whether each target's model is to be wrong in one small way. A fuzzer that is any good must then
/// report a fault, and soon.
inline bool faultIsSeeded()
{
    static const bool isSeeded = std::getenv("ZELVO_FUZZ_CONTROL") != nullptr;
    return isSeeded;
}

/// Ends the run with an input that contradicts a claim.
[[noreturn]] inline void refute(const char *claim)
{
    std::fprintf(stderr, "refuted: %s\n", claim);
    std::abort();
}

inline void check(bool holds, const char *claim)
{
    if (!holds)
        refute(claim);
}

/// A string with nothing behind its terminator, where the address sanitizer catches readers.
class ExactText {
public:
    explicit ExactText(std::string_view text) : bytes_(new char[text.size() + 1])
    {
        std::memcpy(bytes_.get(), text.data(), text.size());
        bytes_[text.size()] = '\0';
    }

    const char *get() const { return bytes_.get(); }

private:
    std::unique_ptr<char[]> bytes_;
};

/// An input that is consumed from its front; behind its end there are zeros.
class Input {
public:
    Input(const uint8_t *data, size_t size)
        : rest_(reinterpret_cast<const char *>(data), size) // NOLINT: bytes are bytes
    {
    }

    bool isAtEnd() const { return rest_.empty(); }

    uint8_t byte()
    {
        const uint8_t first = rest_.empty() ? 0 : static_cast<uint8_t>(rest_.front());
        rest_.remove_prefix(std::min<size_t>(rest_.size(), 1));
        return first;
    }

    /// The next bytes as a number, the first one highest.
    uint64_t number(int bytes)
    {
        uint64_t value = 0;
        for (; bytes > 0; --bytes)
            value = value << 8 | byte();
        return value;
    }

    /// The bytes up to the next zero, or all that are left.
    std::string text()
    {
        const std::string_view taken = rest_.substr(0, rest_.find('\0'));
        rest_.remove_prefix(std::min(rest_.size(), taken.size() + 1));
        return std::string(taken);
    }

    std::string_view rest() const { return rest_; }

private:
    std::string_view rest_;
};

} // namespace zelvo_fuzz

// SPDX-License-Identifier: Apache-2.0
#include "IcuHeap.h"

#include <array>
#include <cstdlib>
#include <cstring>
#include <map>

#include <cxxabi.h>
#include <dlfcn.h>
#include <execinfo.h>
#include <unicode/uclean.h>

namespace zelvo_test {
namespace {

constexpr int DEPTH = 48;
constexpr IcuFault NONE{UINT64_MAX, true};

struct Trace {
    std::array<void *, DEPTH> stack;
    int depth;
};

IcuFault current = NONE;
uint64_t asked = 0;
uint64_t failures = 0;
int64_t live = 0;
bool isTracing = false;
std::map<void *, Trace> traces;

bool strikes()
{
    const uint64_t before = asked++;
    const bool fails = current.once ? before == current.allowed : before >= current.allowed;
    failures += fails ? 1 : 0;
    return fails;
}

void *noted(void *block)
{
    if (isTracing && block != nullptr) {
        Trace trace{};
        trace.depth = backtrace(trace.stack.data(), DEPTH);
        traces[block] = trace;
    }
    return block;
}

void forget(void *block)
{
    if (isTracing)
        traces.erase(block);
}

void *allocate(const void *, size_t size)
{
    if (strikes())
        return nullptr;
    ++live;
    return noted(std::malloc(size));
}

void *reallocate(const void *, void *block, size_t size)
{
    if (strikes())
        return nullptr;
    live += block == nullptr ? 1 : 0;
    forget(block);
    return noted(std::realloc(block, size));
}

void release(const void *, void *block)
{
    live -= block != nullptr ? 1 : 0;
    forget(block);
    std::free(block);
}

std::string readable(const char *symbol)
{
    int status = 0;
    char *name = abi::__cxa_demangle(symbol, nullptr, nullptr, &status);
    std::string result = name != nullptr ? name : symbol;
    std::free(name);
    return result.substr(0, result.find('('));
}

/// "libicuuc.so.72+0x1234" for an address in an ICU library, else "".
std::string icuPlace(void *address, const char *&symbol)
{
    Dl_info info{};
    if (dladdr(address, &info) == 0 || info.dli_fname == nullptr)
        return "";
    const char *slash = std::strrchr(info.dli_fname, '/');
    const std::string library = slash != nullptr ? slash + 1 : info.dli_fname;
    if (!library.starts_with("libicu"))
        return "";
    symbol = info.dli_sname;
    char distance[32];
    std::snprintf(
        distance, sizeof distance, "+0x%zx",
        static_cast<size_t>(static_cast<char *>(address) - static_cast<char *>(info.dli_fbase)));
    return library + distance;
}

/// Those that allocate for others tell nothing.
bool isAllocator(const char *symbol)
{
    return symbol != nullptr &&
           (std::strstr(symbol, "UMemory") != nullptr || std::strstr(symbol, "uprv_") != nullptr);
}

} // namespace

std::string IcuFault::text() const
{
    const std::string number = std::to_string(allowed + 1);
    return once ? "ICU's allocation " + number + " fails"
                : "ICU's allocations from " + number + " on fail";
}

bool takeIcuHeap()
{
    UErrorCode status = U_ZERO_ERROR;
    u_setMemoryFunctions(nullptr, allocate, reallocate, release, &status);
    return U_SUCCESS(status);
}

void failIcu(IcuFault fault)
{
    current = fault;
    asked = 0;
    failures = 0;
}

void failIcuNoMore()
{
    current = NONE;
}

uint64_t icuAsked()
{
    return asked;
}

uint64_t icuFailed()
{
    return failures;
}

int64_t icuLive()
{
    return live;
}

void traceIcu()
{
    isTracing = true;
}

std::set<std::string> leakSites()
{
    isTracing = false;
    std::set<std::string> sites;
    for (const auto &[block, trace] : traces)
        sites.insert(icuSite(trace.stack.data(), trace.depth));
    return sites;
}

std::string icuSite(void *const *stack, int depth)
{
    constexpr int INNERMOST = 3;
    std::string site;
    std::string name;
    int places = 0;
    for (int i = 0; i < depth && places < INNERMOST; ++i) {
        const char *symbol = nullptr;
        const std::string place = icuPlace(stack[i], symbol);
        if (place.empty() || isAllocator(symbol))
            continue;
        name = places == 0 && symbol != nullptr ? readable(symbol) : name;
        site += (places > 0 ? " < " : "") + place;
        ++places;
    }
    return site + (name.empty() ? "" : " in " + name);
}

} // namespace zelvo_test

// SPDX-License-Identifier: Apache-2.0
// The shared library as a program that is not linked with it has it: by name, for a while.
#pragma once

#include <dlfcn.h>

#include "zelvo.h"

namespace zelvo_test {

/// Loads the library, and unloads it at the end of the scope.
class LoadedLibrary {
public:
    LoadedLibrary() : handle_(dlopen(LIBRARY, RTLD_NOW | RTLD_LOCAL)) {}
    LoadedLibrary(const LoadedLibrary &) = delete;
    LoadedLibrary &operator=(const LoadedLibrary &) = delete;
    ~LoadedLibrary()
    {
        if (handle_ != nullptr)
            dlclose(handle_);
    }

    explicit operator bool() const { return handle_ != nullptr; }

    /// The function NAME, which has the type of FUNCTION.
    template <class Function>
    Function *find(const char *name) const
    {
        return reinterpret_cast<Function *>(dlsym(handle_, name));
    }

private:
    void *handle_;
};

} // namespace zelvo_test

// SPDX-License-Identifier: Apache-2.0
// The world in which a call is tried: one of everything, and a way to see whether it has changed.
#pragma once

#include <string>
#include <vector>

#include "ToolkitState.h"
#include "ZlvReadPropsIntl.h"
#include "support/NullCallWorld.h"

namespace zelvo_test {

/// How the world's buffers are left: with no room for one more unit, or never used.
enum class Buffers { FULL, UNUSED };

class World : public NullCallWorld {
public:
    World(Kind kind, Buffers buffers);
    ~World();

    /// A valid argument of type T.
    template <class T>
    T sample()
    {
        if constexpr (std::is_same_v<T, ZlvReadPropsContext *>)
            return &context;
        else if constexpr (std::is_same_v<T, FileHandlerVars *>)
            return &fileVars;
        else if constexpr (std::is_same_v<T, FILE *>)
            return stdout;
        else
            return NullCallWorld::sample<T>();
    }

    ZlvObject *object() { return sample<ZlvObject *>(); }
    ZlvEvent *event() { return sample<ZlvEvent *>(); }

    /// An object that the world holds: a new one, or the one of that name.
    ZlvObject *hold(const char *name, const char *className);

    /// Everything that a call could have changed.
    Lines state();

    ZlvReadPropsContext context{};
    FileHandlerVars fileVars{};
    void *array = nullptr; ///< with its capacity and length, for the calls on arrays
    uint32_t arrayCapacity = 0;
    uint32_t arrayLength = 0;

private:
    void fillBuffers();
    void dropBuffers();
    void addContainers(Lines &lines);
    void addProps(Lines &lines);
    void addEvent(Lines &lines);

    std::vector<ZlvObject *> held_;
};

/// A semaphore key that no other process has at the same time.
int32_t ownSemaphoreKey();

/// Removes the semaphore of that key.
void removeSemaphore();

/// An empty working directory, which goes with its content.
class OwnDirectory {
public:
    OwnDirectory();
    OwnDirectory(const OwnDirectory &) = delete;
    OwnDirectory &operator=(const OwnDirectory &) = delete;
    ~OwnDirectory();

private:
    std::string previous_;
    std::string path_;
};

/// Tells whether PART is WHOLE with some of its characters left out.
bool isCut(const std::string &part, const std::string &whole);

/// Descriptor 1 leads into memory from now on; the stream that leads to the old output.
FILE *captureOutput();

/// What was printed, and what was appended to files of the working directory, since the last time.
std::string newOutput();

/// What all files of the working directory hold.
std::string allFiles();

/// Empties the working directory.
void removeFiles();

} // namespace zelvo_test

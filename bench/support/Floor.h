// SPDX-License-Identifier: Apache-2.0
// The least that a record can cost: the system calls that it needs, with its bytes at hand. The
// files stay open till the process ends.
#pragma once

#include <string>

namespace zelvo_bench {

/// Appends a record, whether or not its file is still there.
class WriteFloor {
public:
    WriteFloor(const std::string &file, std::string record);

    void operator()() const;
    int descriptor() const { return descriptor_; }

private:
    std::string record_;
    int descriptor_;
};

/// Looks whether its file is there, then appends a record: what a file needs that may be moved
/// away.
class AppendFloor {
public:
    AppendFloor(const std::string &file, std::string record);

    void operator()() const;

private:
    std::string file_;
    WriteFloor write_;
};

/// The same, looked at as zelvo does it: without the file's times.
class OwnCallsFloor {
public:
    OwnCallsFloor(const std::string &file, std::string record);

    void operator()() const;

private:
    std::string file_;
    WriteFloor write_;
};

/// Takes a semaphore, measures the file, appends a record and gives the semaphore back:
/// what a file needs that several processes write and roll over.
class SharedFloor {
public:
    SharedFloor(const std::string &file, std::string record, int semaphore);

    void operator()() const;

private:
    WriteFloor write_;
    int semaphore_;
};

} // namespace zelvo_bench

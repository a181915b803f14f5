// SPDX-License-Identifier: Apache-2.0
// Makes the system's resources scarce for a piece of a test.
#pragma once

#include <csignal>
#include <filesystem>
#include <fstream>
#include <string>

#include <sched.h>
#include <sys/mount.h>
#include <sys/resource.h>
#include <unistd.h>

namespace zelvo_test {

/// While one lives, the process has less of a resource than it asks for.
class Limit {
public:
    Limit(__rlimit_resource resource, rlim_t allowed) : resource_(resource)
    {
        getrlimit(resource_, &before_);
        const rlimit scarce{allowed, before_.rlim_max};
        setrlimit(resource_, &scarce);
    }
    Limit(const Limit &) = delete;
    Limit &operator=(const Limit &) = delete;
    ~Limit() { setrlimit(resource_, &before_); }

private:
    __rlimit_resource resource_;
    rlimit before_{};
};

/// While one lives, files cannot grow beyond BYTES: writes are cut short, then fail with EFBIG.
class FileSizeLimit {
public:
    explicit FileSizeLimit(rlim_t bytes) : limit_(RLIMIT_FSIZE, bytes) {}
    FileSizeLimit(const FileSizeLimit &) = delete;
    FileSizeLimit &operator=(const FileSizeLimit &) = delete;
    ~FileSizeLimit() { std::signal(SIGXFSZ, previous_); }

private:
    void (*previous_)(int) = std::signal(SIGXFSZ, SIG_IGN);
    Limit limit_;
};

/// The number that the next descriptor would get: with that many, none is left.
inline rlim_t nextDescriptor()
{
    const int next = dup(0);
    ::close(next);
    return static_cast<rlim_t>(next);
}

/// A small file system in memory, seen by this process and its children alone, under the directory
/// "disk".
class SmallDisk {
public:
    explicit SmallDisk(const char *options = "size=64k")
    {
        std::filesystem::create_directory("disk");
        mounted_ = unshare(CLONE_NEWNS) == 0 &&
                   mount("none", "/", "", MS_REC | MS_PRIVATE, nullptr) == 0 &&
                   mount("none", "disk", "tmpfs", 0, options) == 0;
    }
    SmallDisk(const SmallDisk &) = delete;
    SmallDisk &operator=(const SmallDisk &) = delete;
    ~SmallDisk()
    {
        if (mounted_)
            umount2(path_.c_str(), MNT_DETACH);
    }

    /// Whether this process may mount; without that there is no disk.
    bool isThere() const { return mounted_; }

    /// Takes all the space that is left, with a file of other people's.
    static void fill()
    {
        std::ofstream ballast("disk/ballast", std::ios::binary | std::ios::app);
        while (ballast << std::string(4096, 'b') << std::flush) {
        }
    }
    static void makeRoom() { std::filesystem::remove("disk/ballast"); }

private:
    std::string path_ = std::filesystem::current_path() / "disk";
    bool mounted_ = false;
};

} // namespace zelvo_test

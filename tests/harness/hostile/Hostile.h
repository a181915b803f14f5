// SPDX-License-Identifier: Apache-2.0
// What the tests under hostile hands share: handlers of both classes, other users, and children
// that may not stand still.
#pragma once

#include <filesystem>
#include <fstream>
#include <functional>
#include <string>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include "support/Child.h"
#include "support/FileHandlerFixture.h"
#include "support/Rows.h"

namespace zelvo_test {

namespace fs = std::filesystem;

constexpr const char *ALONE = "zlv_filehandler";
constexpr const char *SHARED = "zlv_multiproc_filehandler";

/// Long enough for anything that ends at all.
constexpr unsigned PATIENCE = 60;

/// The exit status of a child that runs BODY; -1 for one that stands still.
inline int within(unsigned seconds, const std::function<int()> &body)
{
    return inChild([&] {
        alarm(seconds);
        return body();
    });
}

/// Two users who are not root and have no groups.
enum class User : id_t { VICTIM = 65533, OTHER = 65534 };

inline bool become(User user)
{
    const auto id = static_cast<id_t>(user);
    return setgid(id) == 0 && setuid(id) == 0;
}

/// What BODY tells when a user runs it in a child that may not stand still.
inline bool as(User user, const std::function<bool()> &body)
{
    return within(PATIENCE, [&] { return become(user) && body() ? 0 : 1; }) == 0;
}

/// The permission bits of a file or directory, which may be a link to it.
inline unsigned modeOf(const std::string &name)
{
    struct stat facts {};
    return stat(name.c_str(), &facts) == 0 ? facts.st_mode & 07777U : ~0U;
}

/// A test whose handler is of the class that it names.
class Hostile : public MultiProcFixture {
protected:
    template <class... Properties>
    void logTo(const char *className, Properties... properties)
    {
        useClass(className);
        handler(properties...);
    }

    /// Rolls over at every record but the first, and keeps one older file.
    template <class... Properties>
    void logInTurns(const char *className, Properties... properties)
    {
        logTo(className, "fileName", "app.log", "maxFileBytes", "2", "maxFiles", "2",
              properties...);
    }

    /// Lets other users in.
    static void permit(unsigned mode) { chmod(".", mode); }

    static bool isLink(const std::string &name) { return fs::is_symlink(name); }

    /// Opens the file anew at the next record.
    void closeFile() { set("maxFiles", "1"); }
};

struct HandlerClass {
    const char *row;
    const char *name;
};

/// What holds for both classes.
class HostileBoth : public Hostile, public testing::WithParamInterface<HandlerClass> {
protected:
    template <class... Properties>
    void logTo(Properties... properties)
    {
        Hostile::logTo(GetParam().name, properties...);
    }
};

inline const auto handlerClasses =
    testing::Values(HandlerClass{"Alone", ALONE}, HandlerClass{"Shared", SHARED});

/// Tests that need a second user begin with this: what is one's own is never refused.
#define ZELVO_NEEDS_ROOT()                                                                         \
    if (geteuid() != 0)                                                                            \
    GTEST_SKIP() << "only root can become somebody else"

} // namespace zelvo_test

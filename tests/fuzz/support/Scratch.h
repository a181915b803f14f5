// SPDX-License-Identifier: Apache-2.0
// A directory in which the library may do what it likes. Whatever else it is told to open, make,
// rename or remove is refused: inputs name any file there is.
#pragma once

#include <filesystem>
#include <map>
#include <string>

namespace zelvo_fuzz {

/// There is one. It is the working directory while a target visits it, and goes at exit.
class Scratch {
public:
    static const Scratch &only();
    Scratch(const Scratch &) = delete;
    Scratch &operator=(const Scratch &) = delete;
    ~Scratch();

    /// Tells whether a path leads to something in it.
    bool holds(const std::string &path) const;

    /// The content of every file, by its path; afterwards there are none.
    std::map<std::string, std::string> emptied() const;

    /// Makes it the working directory for as long as it lives.
    class Visit {
    public:
        Visit();
        Visit(const Visit &) = delete;
        Visit &operator=(const Visit &) = delete;
        ~Visit();

    private:
        std::filesystem::path home_ = std::filesystem::current_path();
    };

private:
    Scratch();

    std::string path_;
};

} // namespace zelvo_fuzz

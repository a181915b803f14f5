// SPDX-License-Identifier: Apache-2.0
// What a scenario did and got, a line for each step, and how often it met the things that matter.
#pragma once

#include <cstdio>
#include <map>
#include <string>
#include <unordered_set>

#include "support/Text.h"

namespace zelvo_equivalence {

using zelvo_test::Text;
using zelvo_test::UText;

/// A file of lines such as: 17 bind locale="th" text="..." is="..."
class Transcript {
public:
    explicit Transcript(const char *path) : file_(std::fopen(path, "w")) {}
    Transcript(const Transcript &) = delete;
    Transcript &operator=(const Transcript &) = delete;
    ~Transcript()
    {
        if (file_ != nullptr)
            std::fclose(file_);
    }

    bool isOpen() const { return file_ != nullptr; }

    void beginStep(uint64_t number, const char *name);

    /// What the step is done with, and what is not counted as a result.
    void note(const char *name, int64_t value);
    void note(const char *name, double value);
    void note(const char *name, const Text &value);
    void note(const char *name, const UText &value);
    void note(const char *name, const char *value);

    /// What the library has given.
    void result(const char *name, const Text &value);
    void result(const char *name, const UText &value);
    void result(const char *name, int64_t value);

    /// Counts one of the things that a scenario has to meet.
    void count(const std::string &what, uint64_t times = 1) { counts_[what] += times; }

    /// Writes the counts.
    void finish();

private:
    void append(const char *name, const std::string &value);
    void countResult(const std::string &value);

    std::FILE *file_;
    std::map<std::string, uint64_t> counts_;
    std::unordered_set<size_t> distinct_;
};

/// A text in quotes, in ASCII alone.
std::string shown(const Text &text);
std::string shown(const UText &text);

} // namespace zelvo_equivalence

// SPDX-License-Identifier: Apache-2.0
// Acts: short lives of a program with the toolkit, from opening it to closing it.
#pragma once

#include <functional>
#include <string>
#include <utility>
#include <vector>

#include "zelvo.h"

namespace zelvo_test {

/// Where an act is played: what it logs is noted, with what came out and whether memory ran out.
class Stage {
public:
    /// FAILED counts the allocations that have failed so far.
    explicit Stage(std::function<uint64_t()> failed) : failed_(std::move(failed)) {}

    struct Call {
        ZlvStatus status;
        std::string output; ///< what was printed and written meanwhile
        bool isStruck;      ///< an allocation failed in it
    };

    /// Opens the toolkit with a properties file of that content.
    void open(const std::string &properties);
    void close();

    /// The object of that name, held to the end of the act.
    ZlvObject *get(const char *name, const char *className = nullptr);

    /// Makes a logging call.
    template <class Log>
    void log(Log call)
    {
        const uint64_t before = failed_();
        const ZlvStatus status = call();
        const uint64_t failures = failed_() - before;
        failuresInCalls_ += failures;
        calls_.push_back({status, newText(), failures > 0});
    }

    const std::vector<Call> &calls() const { return calls_; }
    /// Tells whether an allocation failed outside of the logging calls.
    bool isStruckElsewhere() const { return isStruckElsewhere_; }
    /// What the files hold at the end.
    const std::string &files() const { return files_; }

private:
    static std::string newText();

    std::function<uint64_t()> failed_;
    std::vector<ZlvObject *> held_;
    std::vector<Call> calls_;
    uint64_t failuresInCalls_ = 0;
    bool isStruckElsewhere_ = false;
    std::string files_;
};

struct Act {
    const char *name;
    void (*play)(Stage &stage);
    bool isOfFiles = false;  ///< its records go to files, with their numbers
    bool isFiltered = false; ///< a filter drops some of its records by their identifiers
};

const std::vector<Act> &everyAct();
/// Acts with faults in them.
const std::vector<Act> &faultyActs();
/// The same for memory of ICU.
const std::vector<Act> &icuFaultyActs();

/// The record of a number, of those that acts write to files.
std::string fileRecord(size_t number);

} // namespace zelvo_test

// SPDX-License-Identifier: Apache-2.0
// The file handler saves system calls that nobody can tell were saved. This test tells: it leads
// both forms through the same random histories and compares every status and every file.
//
// The seed is printed. ZELVO_TEST_SEED=number repeats a run.
#include <cstdlib>
#include <iostream>
#include <random>

#include <fcntl.h>

#include "ZlvFileHandlerIntl.h"
#include "support/FileHandlerFixture.h"

namespace zelvo_test {
namespace {

namespace fs = std::filesystem;

class ZlvFileHandlerDifferential : public FileHandlerFixture {
protected:
    using Trace = std::vector<std::string>;

    ZlvFileHandlerDifferential() { fs::current_path(place_); }

    ~ZlvFileHandlerDifferential() override
    {
        zelvo::measureEachTime = false;
        fs::current_path(directory());
        fs::remove_all(place_);
    }

    /// What one form does in the history of a seed, in a directory of its own.
    Trace traceOf(bool measureEachTime, uint32_t seed)
    {
        zelvo::measureEachTime = measureEachTime;
        fs::create_directory("history");
        fs::current_path("history");
        random_.seed(seed);
        trace_.clear();
        live();
        addFiles();
        fs::current_path("..");
        fs::remove_all("history");
        return trace_;
    }

private:
    struct Step {
        const char *name;
        void (ZlvFileHandlerDifferential::*act)();
        int weight;
    };
    static constexpr int stepsInAHistory = 20;
    static const Step steps[];

    void live()
    {
        begin();
        FileFaults faults;
        for (step_ = 0; step_ < stepsInAHistory; ++step_) {
            const Step &step = chosenStep();
            status_ = {};
            (this->*step.act)();
            addStep(step, faults);
        }
        end();
    }

    void begin()
    {
        handler_ = ZlvGetObject("live", "zlv_filehandler");
        ZlvHandlerSetFormatter(handler_, one(2) ? formatter("framed", LineFormatter::framed)
                                                : formatter("plain", LineFormatter::plain));
        const int limits[] = {0, 0, 1, 10, 40, 100, 200, -1};
        ZlvSetObjPropInt(handler_, "maxFileSize", limits[below(8)]);
        ZlvSetObjPropInt(handler_, "maxFiles", 1 + below(4));
        ZlvSetObjPropBool(handler_, "appending", one(4) ? 0 : 1);
        ZlvSetObjProp(handler_, "fileName", "app.log");
        ZlvAddListener(app_, handler_);
    }

    /// Destroys the handler, which writes its trailer.
    void end()
    {
        ZlvRemListener(app_, handler_);
        ZlvReleaseObject(handler_);
        handler_ = nullptr;
    }

    void addStep(const Step &step, const FileFaults &faults)
    {
        std::ostringstream line;
        line << step_ << ' ' << step.name << ": " << status_.type << status_.code << ", reported "
             << faults.reports << " last " << faults.reported.code
             << (vars()->isOpen ? ", open" : ", closed");
        // Only at the end of a file do writes lengthen it by what they write.
        if (vars()->appending == 1)
            line << ", size " << vars()->currentSize;
        trace_.push_back(line.str());
    }

    void addFiles()
    {
        Trace found;
        for (const auto &entry : fs::recursive_directory_iterator("."))
            found.push_back(entry.path().string() + " = " +
                            file(entry.path()).value_or("no regular file"));
        std::sort(found.begin(), found.end());
        trace_.insert(trace_.end(), found.begin(), found.end());
    }

    const Step &chosenStep();

    int below(int bound) { return static_cast<int>(random_() % static_cast<uint32_t>(bound)); }
    bool one(int in) { return below(in) == 0; }
    std::string newName(const char *prefix) const { return prefix + std::to_string(step_); }
    std::string someFile() { return one(4) ? "app1.log" : "app.log"; }
    bool isFree(const std::string &name) const { return !fs::exists(fs::symlink_status(name)); }

    void record()
    {
        const auto text = std::u16string(static_cast<size_t>(1 + below(40)), u'a') +
                          static_cast<char16_t>(u'A' + step_);
        status_ = logged(text.c_str());
    }
    void recordWithoutText() { status_ = logged(u""); }
    void openIt()
    {
        const CxStatus status = openHandler();
        status_ = {status.type, status.code, 0};
    }
    void closeIt() { closeHandler(); }
    void closeBehind()
    {
        if (vars()->isOpen == 1 && fcntl(vars()->file, F_GETFD) != -1)
            ::close(vars()->file);
    }
    void unlink() { ::unlink(someFile().c_str()); }
    void moveAway() { ::rename("app.log", newName("moved").c_str()); }
    void moveAndReturn()
    {
        ::rename("app.log", "away");
        ::rename("away", "app.log");
    }
    void recreate()
    {
        ::unlink("app.log");
        if (isFree("app.log"))
            write("app.log", std::string(static_cast<size_t>(below(60)), 'r'));
    }
    void replace()
    {
        write("new", std::string(static_cast<size_t>(below(60)), 'n'));
        if (::rename("new", someFile().c_str()) != 0)
            ::unlink("new");
    }
    void swapWithOlder()
    {
        ::rename("app1.log", "away");
        ::rename("app.log", "app1.log");
        ::rename("away", "app.log");
    }
    void truncate() { resize(static_cast<off_t>(one(2) ? 0 : below(120))); }
    void appendOutside()
    {
        if (fs::is_regular_file("app.log"))
            std::ofstream("app.log", std::ios::app)
                << std::string(static_cast<size_t>(below(80)), 'o');
    }
    void link()
    {
        const std::string target = newName("target");
        moveAway();
        if (!one(4))
            write(target, std::string(static_cast<size_t>(below(60)), 't'));
        if (isFree("app.log"))
            fs::create_symlink(target, "app.log");
    }
    void becomeALink()
    {
        const std::string target = newName("linked");
        if (fs::is_regular_file(fs::symlink_status("app.log")) &&
            ::rename("app.log", target.c_str()) == 0)
            fs::create_symlink(target, "app.log");
    }
    void directoryInPlace()
    {
        moveAway();
        ::mkdir("app.log", 0700);
    }
    void olderDirectory() { ::mkdir("app1.log", 0700); }
    void removeDirectories()
    {
        ::rmdir("app.log");
        ::rmdir("app1.log");
    }
    void newLimit() { ZlvSetObjPropInt(handler_, "maxFileBytes", below(100)); }
    void newCount() { ZlvSetObjPropInt(handler_, "maxFiles", 1 + below(4)); }

    static void resize(off_t size) { static_cast<void>(::truncate("app.log", size) == 0); }

    /// An empty directory in memory, where that can be had: histories change many files.
    fs::path madePlace() const
    {
        std::string pattern = "/dev/shm/zelvo-XXXXXX";
        return mkdtemp(pattern.data()) != nullptr ? fs::path(pattern) : directory();
    }

    const fs::path place_ = madePlace();
    std::mt19937 random_;
    Trace trace_;
    ZlvStatus status_{};
    int step_ = 0;
};

const ZlvFileHandlerDifferential::Step ZlvFileHandlerDifferential::steps[] = {
    {"record", &ZlvFileHandlerDifferential::record, 40},
    {"record without text", &ZlvFileHandlerDifferential::recordWithoutText, 3},
    {"open", &ZlvFileHandlerDifferential::openIt, 4},
    {"close", &ZlvFileHandlerDifferential::closeIt, 3},
    {"close behind", &ZlvFileHandlerDifferential::closeBehind, 5},
    {"unlink", &ZlvFileHandlerDifferential::unlink, 4},
    {"move away", &ZlvFileHandlerDifferential::moveAway, 3},
    {"move and return", &ZlvFileHandlerDifferential::moveAndReturn, 2},
    {"recreate", &ZlvFileHandlerDifferential::recreate, 4},
    {"replace", &ZlvFileHandlerDifferential::replace, 4},
    {"swap with older", &ZlvFileHandlerDifferential::swapWithOlder, 2},
    {"truncate", &ZlvFileHandlerDifferential::truncate, 4},
    {"append outside", &ZlvFileHandlerDifferential::appendOutside, 4},
    {"link", &ZlvFileHandlerDifferential::link, 2},
    {"become a link", &ZlvFileHandlerDifferential::becomeALink, 2},
    {"directory in place", &ZlvFileHandlerDifferential::directoryInPlace, 2},
    {"older directory", &ZlvFileHandlerDifferential::olderDirectory, 1},
    {"remove directories", &ZlvFileHandlerDifferential::removeDirectories, 4},
    {"new limit", &ZlvFileHandlerDifferential::newLimit, 1},
    {"new count", &ZlvFileHandlerDifferential::newCount, 1},
};

const ZlvFileHandlerDifferential::Step &ZlvFileHandlerDifferential::chosenStep()
{
    int all = 0;
    for (const Step &step : steps)
        all += step.weight;
    const Step *step = steps;
    for (int at = below(all); at >= step->weight; ++step)
        at -= step->weight;
    return *step;
}

TEST_F(ZlvFileHandlerDifferential, BothFormsDoTheSameInRandomHistories)
{
    constexpr uint32_t histories = 2000;
    const char *given = std::getenv("ZELVO_TEST_SEED");
    const uint32_t seed =
        given ? static_cast<uint32_t>(std::strtoul(given, nullptr, 10)) : std::random_device()();
    std::cout << "ZELVO_TEST_SEED=" << seed << std::endl;
    for (uint32_t history = 0; history < histories; ++history)
        ASSERT_EQ(traceOf(false, seed + history), traceOf(true, seed + history))
            << "ZELVO_TEST_SEED=" << seed + history;
}

} // namespace
} // namespace zelvo_test

// SPDX-License-Identifier: Apache-2.0
// Classes of one's own for tests: one of each kind at least, and a fixture that registers them.
#pragma once

#include <cstring>

#include "CppTest.h"

namespace zelvo_test {

/// What has become of the states of all classes of this file.
struct Counts {
    int made = 0;
    int destroyed = 0;
    int closed = 0;
};
inline Counts counts;

/// Counts its life, and that of what it inherits from it.
struct Counted {
    Counted() noexcept { ++counts.made; }
    Counted(const Counted &) = delete;
    Counted &operator=(const Counted &) = delete;
    ~Counted() { ++counts.destroyed; }
};

/// A handler that gathers texts up to a limit.
class Gatherer : Counted {
public:
    bool configure(zelvo::Self self, const char *property) noexcept
    {
        if (std::strcmp(property, "limit") != 0)
            return false;
        limit_ = self.property<int32_t>("limit").value_or(-1);
        return true;
    }

    void process(zelvo::Self self, const zelvo::Event &event) noexcept
    {
        if (int32_t(texts_.size()) < limit_)
            texts_.emplace_back(event.text().view());
        if (event.level() == ZLV_LEVEL_FATAL)
            event.fail({CX_STATUS_PLATFORM, ENOSPC});
        event.setProperty("seen_by", self.name());
        self.passOn(event);
    }

    void close(zelvo::Self) noexcept { ++counts.closed; }

    int32_t limit() const { return limit_; }
    const std::vector<std::u16string> &texts() const { return texts_; }

private:
    int32_t limit_ = 2;
    std::vector<std::u16string> texts_;
};

/// A filter that lets every second event pass.
class Alternator : Counted {
public:
    bool accepts(zelvo::Self, zelvo::Event) noexcept { return (pass_ = !pass_); }

private:
    bool pass_ = false;
};

/// A logger that stamps events with a number each.
class Numbering : Counted {
public:
    void log(zelvo::Self self, zelvo::Event event) noexcept
    {
        event.setProperty("number", ++number_);
        event.setMessageId("ID7");
        self.passOn(event);
    }

private:
    int32_t number_ = 0;
};

/// A logger whose messages are German.
class Germanising {
public:
    void log(zelvo::Self self, zelvo::Event event) noexcept
    {
        event.setLocale("de");
        self.passOn(event);
    }
};

/// A formatter that puts a text between brackets.
class Brackets {
public:
    zelvo::UString format(zelvo::Self, zelvo::Event event) noexcept
    {
        std::u16string text = u"[";
        text += event.text().view();
        text += u"]";
        return zelvo::UString::copyOf(text);
    }

    zelvo::String header(zelvo::Self) noexcept { return zelvo::String::copyOf("begin"); }
    zelvo::String trailer(zelvo::Self) noexcept { return zelvo::String::copyOf("end"); }
};

/// A handler that asks its formatter for everything, and holds it.
class Asking {
public:
    void process(zelvo::Self self, zelvo::Event event) noexcept
    {
        formatter_ = self.object("brackets");
        all_ = std::string(self.header().view());
        all_ += zelvo::bytes(self.format(event)).view();
        all_ += self.trailer().view();
    }

    const std::string &all() const { return all_; }

private:
    zelvo::InnerObject formatter_;
    std::string all_;
};

/// Registers the classes of this file.
class CppOwnClass : public CppTest {
protected:
    void SetUp() override
    {
        CppTest::SetUp();
        counts = {};
        zelvo::addHandlerClass<Gatherer>("gatherer");
        zelvo::addFilterClass<Alternator>("alternator");
        zelvo::addLoggerClass<Numbering>("numbering");
        zelvo::addLoggerClass<Germanising>("germanising");
        zelvo::addFormatterClass<Brackets>("brackets");
        zelvo::addHandlerClass<Asking>("asking");
    }

    /// Makes an object what it is when there was no memory for its state.
    template <class T>
    static void loseState(const zelvo::Object &object)
    {
        object.get()->objClass->fFreeVars(object.get()->vars);
        object.get()->vars = nullptr;
        EXPECT_FALSE(zelvo::withState<T>(object, [](T &) { FAIL(); }));
    }

    static std::vector<std::u16string> textsOf(const zelvo::Handler &handler)
    {
        std::vector<std::u16string> texts;
        EXPECT_TRUE(zelvo::withState<Gatherer>(
            handler, [&texts](const Gatherer &gatherer) { texts = gatherer.texts(); }));
        return texts;
    }
};

} // namespace zelvo_test

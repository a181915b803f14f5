// SPDX-License-Identifier: Apache-2.0
// A fixture with an open toolkit and the logger "app", for tests of the two file handlers.
#pragma once

#include <utility>

#include <sys/sem.h>

#include "ZlvFileHandler.h"
#include "ZlvHandler.h"
#include "ZlvMultiProcFileHandler.h"
#include "ZlvOwned.h"
#include "support/FileFaults.h"
#include "support/LineFormatter.h"
#include "support/Recorder.h"
#include "support/StatusIs.h"
#include "support/ToolkitFixture.h"

namespace zelvo_test {

/// Tests make the one handler that listens to the logger with handler("fileName", "app.log", ...),
/// log through it, and look at files.
class FileHandlerFixture : public ToolkitFixture {
protected:
    FileHandlerFixture() : FileHandlerFixture("zlv_filehandler") {}
    explicit FileHandlerFixture(const char *className) : className_(className) {}

    void SetUp() override
    {
        open();
        LineFormatter::addClasses();
        Recorder::addClass();
        app_ = logger("app");
    }

    /// Makes the handler, with plain records and the given properties: names and values in turn.
    template <class... Properties>
    ZlvObject *handler(Properties... properties)
    {
        handler_ = object("log", className_);
        ZlvHandlerSetFormatter(handler_, formatter("plain", LineFormatter::plain));
        set(properties...);
        ZlvAddListener(app_, handler_);
        return handler_;
    }

    /// The same, with records between a header and a trailer.
    template <class... Properties>
    ZlvObject *framedHandler(Properties... properties)
    {
        handler(properties...);
        ZlvHandlerSetFormatter(handler_, formatter("framed", LineFormatter::framed));
        return handler_;
    }

    /// Sets properties of the handler: names and values in turn.
    void set() {}
    template <class... More>
    void set(const char *property, const char *value, More... more)
    {
        setProp(handler_, property, value);
        set(more...);
    }

    /// Has handler() make one of another class.
    void useClass(const char *className) { className_ = className; }

    /// The handler's variables.
    FileHandlerVars *vars() const { return static_cast<FileHandlerVars *>(handler_->vars); }

    /// Logs TEXT, a pattern without arguments; the status that the caller gets.
    ZlvStatus logged(const char16_t *text) { return ToolkitFixture::log(app_, text); }
    /// The same for records that must come through.
    void log(const char16_t *text) { EXPECT_TRUE(ok(logged(text))); }

    static testing::AssertionResult ok(ZlvStatus status) { return is(status, '-', 0); }
    static testing::AssertionResult failed(ZlvStatus status, int32_t code)
    {
        return is(status, 'p', code);
    }

    /// The handler's own entries, called as the toolkit does, with the API mutex held.
    CxStatus openHandler()
    {
        zelvo::ApiLock lock;
        return ZlvFileHandlerFOpenWithErr(handler_);
    }
    void closeHandler()
    {
        zelvo::ApiLock lock;
        handler_->objClass->handler.fClose(handler_);
    }

    /// Adds a recorder to the handler's own listeners.
    void listenToHandler() { ZlvAddListener(handler_, object("behind", Recorder::className)); }

    /// The content of a file; nothing when there is none.
    static Text file(const std::string &name)
    {
        return std::filesystem::is_regular_file(name) ? Text(read(name)) : std::nullopt;
    }
    /// The content of the older file NUMBER of "app.log".
    static Text rolled(int number) { return file("app" + std::to_string(number) + ".log"); }

    /// The permission bits of a file.
    static unsigned modeOf(const std::string &name)
    {
        return static_cast<unsigned>(std::filesystem::status(name).permissions());
    }

    ZlvObject *app_ = nullptr;
    ZlvObject *handler_ = nullptr;

private:
    static testing::AssertionResult is(ZlvStatus status, char type, int32_t code)
    {
        return statusIs({status.type, status.code}, type, code);
    }

    const char *className_;
};

/// The same with the handler that several processes share. Each test has a semaphore of its own,
/// which goes at the end.
class MultiProcFixture : public FileHandlerFixture {
protected:
    MultiProcFixture() : FileHandlerFixture("zlv_multiproc_filehandler") {}

    void TearDown() override
    {
        removeSet();
        FileHandlerFixture::TearDown();
    }

    template <class... Properties>
    ZlvObject *handler(Properties... properties)
    {
        return FileHandlerFixture::handler("MPFileSemKey", keyText_.c_str(), properties...);
    }
    template <class... Properties>
    ZlvObject *framedHandler(Properties... properties)
    {
        return FileHandlerFixture::framedHandler("MPFileSemKey", keyText_.c_str(), properties...);
    }

    CxStatus openHandler()
    {
        zelvo::ApiLock lock;
        return ZlvMultiProcFileHandlerFOpenWithErr(handler_);
    }
    bool initSem() { return called(zlvMultiProcFileHandlerInitSem); }
    bool lockSem() { return called(zlvMultiProcFileHandlerLockSem); }
    void unlockSem()
    {
        zelvo::ApiLock lock;
        zlvMultiProcFileHandlerUnlockSem(handler_);
    }

    /// The set of the test's key; -1 when there is none.
    int semSet() const { return semget(key_, 1, 0); }
    int semValue() const { return semctl(semSet(), 0, GETVAL); }
    void setSemValue(int value) { semctl(semSet(), 0, SETVAL, value); }
    void removeSet() { semctl(semSet(), 0, IPC_RMID); }

    /// Returns once a process waits for the semaphore.
    void untilSomebodyWaits() const
    {
        while (semctl(semSet(), 0, GETNCNT) == 0)
            sched_yield();
    }

    const key_t key_ = static_cast<key_t>(0x5a000000 + getpid());

private:
    bool called(ZlvBool (*step)(ZlvObject *))
    {
        zelvo::ApiLock lock;
        return step(handler_) == 1;
    }

    const std::string keyText_ = std::to_string(key_);
};

} // namespace zelvo_test

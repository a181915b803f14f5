// SPDX-License-Identifier: Apache-2.0
// An object whose properties are set through its configuration, as a properties file sets them, and
// what a test needs around it to see their effect.
#pragma once

#include <string>

#include "support/VaList.h"
#include "zelvo.h"

namespace zelvo_test {

/// One life of the toolkit, in an empty working directory, with the object "subject".
class Subject {
public:
    explicit Subject(const std::string &className);
    ~Subject();
    Subject(const Subject &) = delete;
    Subject &operator=(const Subject &) = delete;

    ZlvObject *object() const { return object_; }
    bool isFileHandler() const;

    /// Sets a property in the configuration and applies that; null removes the property.
    void configure(const char *key, const char *value);

    /// Keeps a handler of shared files away from the semaphore that others use.
    void takeOwnSemaphore();

    /// Has a file handler write a record; closes its file; its variables.
    void log();
    void close();
    FileHandlerVars *fileVars() const { return static_cast<FileHandlerVars *>(object_->vars); }

    /// What the formatter makes of an event; "" without a text.
    std::string render(ZlvEvent *event, double number = 0);

private:
    ZlvObject *object_ = nullptr;
    ZlvObject *source_ = nullptr; ///< the logger that a handler listens to
    ZlvObject *output_ = nullptr; ///< the handler that a formatter works for
    bool ownsSemaphore_ = false;
};

/// An event at a fixed time whose message is TEXT.
class Event {
public:
    explicit Event(const UChar *text, ZlvLevel level = ZLV_LEVEL_NONE);
    ~Event() { ZlvFreeEvent(event_); }
    Event(const Event &) = delete;
    Event &operator=(const Event &) = delete;

    ZlvEvent *get() const { return event_; }

private:
    ZlvEvent *event_;
};

/// The text of a string that belongs to the test, which frees it; "none" without one.
std::string textOf(char *owned);

} // namespace zelvo_test

// SPDX-License-Identifier: Apache-2.0
// The kinds of records that are measured, and trees of objects that write them.
#pragma once

#include <string>
#include <utility>
#include <vector>

#include "support/Measure.h"
#include "zelvo.h"

namespace zelvo_bench {

/// The toolkit, for as long as this lives, in the locale of the environment.
class OpenToolkit {
public:
    explicit OpenToolkit(const char *properties = nullptr);
    OpenToolkit(const OpenToolkit &) = delete;
    OpenToolkit &operator=(const OpenToolkit &) = delete;
    ~OpenToolkit() { ZlvCloseToolkit(); }
};

/// A reference to an object.
class Held {
public:
    Held(const std::string &name, const char *className);
    Held(const Held &) = delete;
    Held(Held &&other) noexcept : object_(std::exchange(other.object_, nullptr)) {}
    Held &operator=(const Held &) = delete;
    ~Held() { ZlvReleaseObject(object_); }

    ZlvObject *get() const { return object_; }
    void set(const char *property, const std::string &value) const
    {
        ZlvSetObjProp(object_, property, value.c_str());
    }

private:
    ZlvObject *object_;
};

/// What all records tell.
constexpr const UChar *ASKED = u"Client {0} asked for {1} ({2,number,integer})";
constexpr const UChar *CLIENT = u"10.23.42.17";
constexpr const UChar *WISH = u"/articles/index.html";
constexpr int32_t SERIAL = 4711;

/// A kind of record: the classes and the call that make it.
struct Kind {
    const char *name;
    const char *loggerClass;
    const char *formatterClass;
    const char *locale; ///< of the formatter; null leaves ICU's default
    void (*log)(ZlvObject *logger);
};

extern const Kind LINE;
extern const std::vector<Kind> allKinds;

/// Asks for a handler that shares its file with other processes.
struct Shared {
    int32_t semaphoreKey;
};

/// A logger, some handlers with a file each, and their formatter.
class Tree {
public:
    Tree(const Place &place, const Kind &kind, unsigned handlers = 1);
    Tree(const Place &place, const Kind &kind, Shared shared);

    /// The file of a tree that shares it.
    static std::string sharedFile(const Place &place) { return place.file("shared.log"); }

    /// Sets a property of each handler.
    void set(const char *property, const std::string &value) const;

    void log() const { log_(logger_.get()); }
    ZlvObject *logger() const { return logger_.get(); }
    const std::vector<std::string> &files() const { return files_; }
    /// The bytes of one record.
    std::string sample() const;
    Output output() const { return {files_, sample().size()}; }

private:
    Tree(const std::string &name, const Kind &kind);
    void addHandler(const std::string &file, const char *className);

    std::string name_;
    void (*log_)(ZlvObject *);
    Held logger_;
    Held formatter_;
    std::vector<Held> handlers_;
    std::vector<std::string> files_;
};

} // namespace zelvo_bench

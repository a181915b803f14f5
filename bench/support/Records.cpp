// SPDX-License-Identifier: Apache-2.0
#include "support/Records.h"

#include <clocale>
#include <cstdio>
#include <cstdlib>

namespace zelvo_bench {

namespace {

void logText(ZlvObject *logger)
{
    ZlvLogDebugMin(logger, nullptr, nullptr, 0, ASKED, CLIENT, WISH, SERIAL);
}

void logTextWithSource(ZlvObject *logger)
{
    ZlvLogDebugMin(logger, __FILE_NAME__, __func__, __LINE__, ASKED, CLIENT, WISH, SERIAL);
}

void logMessage(ZlvObject *logger)
{
    ZlvLogInfo(logger, ZELVO_BENCH_BUNDLE, "asked", CLIENT, WISH, SERIAL);
}

[[noreturn]] void fail(const std::string &what)
{
    std::fprintf(stderr, "%s\n", what.c_str());
    std::exit(1);
}

} // namespace

const Kind LINE{"line", "zlv_basiclogger", "zlv_basicformatter", nullptr, logText};

const std::vector<Kind> allKinds{
    LINE,
    {"localised en", "zlv_basiclogger", "zlv_basicformatter", "en", logMessage},
    {"localised de", "zlv_basiclogger", "zlv_basicformatter", "de", logMessage},
    {"debug", "zlv_basiclogger", "zlv_basicformatter", nullptr, logTextWithSource},
    {"xml", "zlv_pdlogger", "zlv_xmlformatter", nullptr, logMessage},
    {"trace", "zlv_pdlogger", "zlv_vyxtraceformatter", nullptr, logTextWithSource},
};

OpenToolkit::OpenToolkit(const char *properties)
{
    std::setlocale(LC_ALL, "");
    if (!ZlvOpenToolkit(properties, nullptr))
        fail("the toolkit does not open");
}

Held::Held(const std::string &name, const char *className)
    : object_(ZlvGetObject(name.c_str(), className))
{
    if (object_ == nullptr)
        fail("no object " + name);
}

Tree::Tree(const std::string &name, const Kind &kind)
    : name_(name), log_(kind.log), logger_(name_ + ".log", kind.loggerClass),
      formatter_(name_ + ".format", kind.formatterClass)
{
    logger_.set("product", "Shop");
    logger_.set("component", "Till");
    logger_.set("server", "till7.example.org");
    if (kind.locale != nullptr)
        formatter_.set("locale", kind.locale);
}

/// The file may grow to 2 GiB: its size is tested as ever, but nothing rolls over meanwhile.
void Tree::addHandler(const std::string &file, const char *className)
{
    const Held &handler =
        handlers_.emplace_back(name_ + ".file" + std::to_string(files_.size()), className);
    files_.push_back(file);
    handler.set("fileName", file);
    handler.set("maxFileBytes", "2147483647");
    ZlvHandlerSetFormatter(handler.get(), formatter_.get());
    ZlvAddListener(logger_.get(), handler.get());
}

Tree::Tree(const Place &place, const Kind &kind, unsigned handlers)
    : Tree(kind.name + std::to_string(handlers), kind)
{
    for (unsigned i = 0; i < handlers; ++i)
        addHandler(place.file(name_ + static_cast<char>('a' + i) + ".log"), "zlv_filehandler");
}

Tree::Tree(const Place &place, const Kind &kind, Shared shared) : Tree("shared", kind)
{
    addHandler(sharedFile(place), "zlv_multiproc_filehandler");
    set("MPFileSemKey", std::to_string(shared.semaphoreKey));
}

void Tree::set(const char *property, const std::string &value) const
{
    for (const Held &handler : handlers_)
        handler.set(property, value);
}

std::string Tree::sample() const
{
    empty(files_[0]);
    log();
    std::string record = contentOf(files_[0]);
    if (record.empty())
        fail(files_[0] + ": nothing was logged");
    return record;
}

} // namespace zelvo_bench

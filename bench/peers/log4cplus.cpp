// SPDX-License-Identifier: Apache-2.0
// log4cplus: a FileAppender with ImmediateFlush. For each record it locks two mutexes, makes the
// line in a stream and flushes the file's stream: one write(). It does not look whether its file is
// still there. With a lock file, which lets several processes append to one file, each record costs
// fcntl(), lseek(), write() and fcntl(); such a FileAppender does not roll over. The library starts
// four threads when it is initialised, so that this process has more than one.
#include <log4cplus/configurator.h>
#include <log4cplus/fileappender.h>
#include <log4cplus/initializer.h>
#include <log4cplus/logger.h>
#include <log4cplus/loggingmacros.h>

#include "process/OwnSemaphore.h"
#include "support/Contest.h"

using namespace zelvo_bench;

namespace {

log4cplus::Logger loggerTo(const std::string &file, const std::string &lockFile)
{
    log4cplus::helpers::Properties properties;
    properties.setProperty("File", file);
    properties.setProperty("Append", "true");
    properties.setProperty("ImmediateFlush", "true");
    properties.setProperty("layout", "log4cplus::PatternLayout");
    properties.setProperty("layout.ConversionPattern", "%D{%Y-%m-%d %H:%M:%S.%q%z} %m%n");
    if (!lockFile.empty()) {
        properties.setProperty("UseLockFile", "true");
        properties.setProperty("LockFile", lockFile);
    }
    log4cplus::Logger logger = log4cplus::Logger::getInstance(file);
    logger.setAdditivity(false);
    logger.addAppender(log4cplus::SharedAppenderPtr(new log4cplus::FileAppender(properties)));
    logger.setLogLevel(log4cplus::INFO_LOG_LEVEL);
    return logger;
}

void log(const log4cplus::Logger &logger)
{
    LOG4CPLUS_INFO(logger,
                   "Client " << PEER_CLIENT << " asked for " << PEER_WISH << " (" << SERIAL << ")");
}

} // namespace

int main(int argc, char **argv)
{
    const log4cplus::Initializer initializer;
    const zelvo_test::OwnSemaphore semaphore;
    Contest contest;

    const std::string file = contest.file("log4cplus");
    const log4cplus::Logger logger = loggerTo(file, "");
    contest.record("log4cplus", file, [logger] { log(logger); });

    const std::string locked = contest.file("log4cplus_locked");
    const log4cplus::Logger locking = loggerTo(locked, contest.file("lock"));
    contest.record("log4cplus with lock file", locked, [locking] { log(locking); });
    contest.shared(semaphore.key());

    const std::string unused = contest.file("log4cplus_off");
    log4cplus::Logger off = loggerTo(unused, "");
    off.setLogLevel(log4cplus::WARN_LOG_LEVEL);
    contest.refusal("log4cplus refused", unused, [off] { log(off); });
    return runBenchmarks(argc, argv);
}

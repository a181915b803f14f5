// SPDX-License-Identifier: Apache-2.0
// log4cxx: a FileAppender, which flushes each record. It locks a mutex, makes the line in a string,
// converts it to the file's encoding and flushes: one write(). It does not look whether its file is
// still there.
#include <log4cxx/fileappender.h>
#include <log4cxx/logger.h>
#include <log4cxx/patternlayout.h>

#include "support/Contest.h"

using namespace zelvo_bench;

namespace {

log4cxx::LoggerPtr loggerTo(const std::string &file)
{
    const auto layout =
        std::make_shared<log4cxx::PatternLayout>("%d{yyyy-MM-dd HH:mm:ss.SSSZ} %m%n");
    const auto appender = std::make_shared<log4cxx::FileAppender>(layout, file, true);
    const log4cxx::LoggerPtr logger = log4cxx::Logger::getLogger(file);
    logger->setAdditivity(false);
    logger->addAppender(appender);
    logger->setLevel(log4cxx::Level::getInfo());
    return logger;
}

void log(const log4cxx::LoggerPtr &logger)
{
    LOG4CXX_INFO(logger,
                 "Client " << PEER_CLIENT << " asked for " << PEER_WISH << " (" << SERIAL << ")");
}

} // namespace

int main(int argc, char **argv)
{
    const Contest contest;
    const std::string file = contest.file("log4cxx");
    const log4cxx::LoggerPtr logger = loggerTo(file);
    contest.record("log4cxx", file, [logger] { log(logger); });

    const std::string unused = contest.file("log4cxx_off");
    const log4cxx::LoggerPtr off = loggerTo(unused);
    off->setLevel(log4cxx::Level::getWarn());
    contest.refusal("log4cxx refused", unused, [off] { log(off); });
    return runBenchmarks(argc, argv);
}

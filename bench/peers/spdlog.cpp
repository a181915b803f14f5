// SPDX-License-Identifier: Apache-2.0
// spdlog: a basic_file_sink_mt with flush_on(trace). For each record it locks a mutex, makes the
// line in a buffer on the stack, gives it to fwrite() and calls fflush(): one write(), and no other
// system call. The local time is broken down once per second. It does not look whether its file is
// still there, nor how large it is: a file that is deleted or moved away keeps its records. Hence
// the second figure, where the caller makes the promise that this toolkit's file handler makes, by
// a stat() of the name before each record.
#include <spdlog/sinks/basic_file_sink.h>
#include <spdlog/spdlog.h>
#include <sys/stat.h>

#include "support/Contest.h"

using namespace zelvo_bench;

namespace {

std::shared_ptr<spdlog::logger> loggerTo(const std::string &file)
{
    auto logger = spdlog::basic_logger_mt(file, file);
    logger->set_pattern("%Y-%m-%d %H:%M:%S.%e%z %v");
    logger->flush_on(spdlog::level::trace);
    return logger;
}

void log(spdlog::logger &logger)
{
    logger.info("Client {} asked for {} ({})", PEER_CLIENT, PEER_WISH, SERIAL);
}

} // namespace

int main(int argc, char **argv)
{
    const Contest contest;
    const std::string file = contest.file("spdlog");
    const auto logger = loggerTo(file);
    contest.record("spdlog", file, [logger] { log(*logger); });

    const std::string named = contest.file("spdlog_stat");
    const auto careful = loggerTo(named);
    contest.record("spdlog with stat", named, [careful, named] {
        struct stat facts;
        benchmark::DoNotOptimize(stat(named.c_str(), &facts));
        log(*careful);
    });

    const std::string unused = contest.file("spdlog_off");
    const auto off = loggerTo(unused);
    off->set_level(spdlog::level::warn);
    contest.refusal("spdlog refused", unused, [off] { log(*off); });
    return runBenchmarks(argc, argv);
}

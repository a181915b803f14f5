// SPDX-License-Identifier: Apache-2.0
// glog: LOG(INFO) to its file for INFO, with logbuflevel -1, which flushes each record. Its lines
// begin with glog's own prefix: level, time, thread, source file and line. For each record it makes
// the line in a buffer of its own, asks gettid() and getpid(), locks a mutex, and gives the line to
// fwrite() and fflush(): one write(). While TZ is not set, breaking down the local time costs a
// stat() of /etc/localtime. It does not look whether its file is still there. LOG() below
// minloglevel makes the whole text before it drops it; VLOG() is the cheap way to refuse.
#include <glog/logging.h>

#include "support/Contest.h"

using namespace zelvo_bench;

namespace {

void startLogging(const char *program, const std::string &file)
{
    FLAGS_logbuflevel = -1;
    FLAGS_timestamp_in_logfile_name = false;
    google::InitGoogleLogging(program);
    google::SetLogDestination(google::GLOG_INFO, file.c_str());
    google::SetLogSymlink(google::GLOG_INFO, "");
}

void log()
{
    LOG(INFO) << "Client " << PEER_CLIENT << " asked for " << PEER_WISH << " (" << SERIAL << ")";
}

void logVerbosely()
{
    VLOG(1) << "Client " << PEER_CLIENT << " asked for " << PEER_WISH << " (" << SERIAL << ")";
}

void switchOff(const benchmark::State &)
{
    FLAGS_minloglevel = google::GLOG_WARNING;
}

void switchOn(const benchmark::State &)
{
    FLAGS_minloglevel = google::GLOG_INFO;
}

/// Makes the whole text before it finds out that nobody wants it.
void measureLateRefusal(const Contest &contest, const std::string &file)
{
    FLAGS_minloglevel = google::GLOG_WARNING;
    contest.refusal("glog refused late", file, log)->Setup(switchOff)->Teardown(switchOn);
    FLAGS_minloglevel = google::GLOG_INFO;
}

} // namespace

int main(int argc, char **argv)
{
    const Contest contest;
    const std::string file = contest.file("glog");
    startLogging(argv[0], file);
    contest.record("glog", file, log);
    contest.refusal("glog refused", file, logVerbosely);
    measureLateRefusal(contest, file);
    return runBenchmarks(argc, argv);
}

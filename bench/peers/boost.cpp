// SPDX-License-Identifier: Apache-2.0
// Boost.Log: a synchronous sink with a text_file_backend and auto_flush. For each record it
// collects the attributes, locks the sink's mutex, makes the line in a stream and flushes the
// file's stream: one write(). It does not look whether its file is still there. Its time has
// microseconds and no offset from UTC.
#include <boost/log/attributes.hpp>
#include <boost/log/core.hpp>
#include <boost/log/expressions.hpp>
#include <boost/log/sinks.hpp>
#include <boost/log/sources/global_logger_storage.hpp>
#include <boost/log/sources/record_ostream.hpp>
#include <boost/log/sources/severity_logger.hpp>
#include <boost/log/support/date_time.hpp>
#include <boost/log/utility/setup/common_attributes.hpp>
#include <boost/make_shared.hpp>

#include "support/Contest.h"

using namespace zelvo_bench;

namespace expr = boost::log::expressions;
namespace sinks = boost::log::sinks;

namespace {

enum Severity { INFO, WARN };

using Logger = boost::log::sources::severity_logger_mt<Severity>;
using Sink = sinks::synchronous_sink<sinks::text_file_backend>;

void logTo(const std::string &file)
{
    namespace keywords = boost::log::keywords;
    const auto backend = boost::make_shared<sinks::text_file_backend>(
        keywords::file_name = file, keywords::open_mode = std::ios::app,
        keywords::auto_flush = true);
    const auto sink = boost::make_shared<Sink>(backend);
    sink->set_formatter(expr::stream << expr::format_date_time<boost::posix_time::ptime>(
                                            "TimeStamp", "%Y-%m-%d %H:%M:%S.%f")
                                     << ' ' << expr::smessage);
    boost::log::core::get()->add_sink(sink);
    boost::log::core::get()->add_global_attribute("TimeStamp",
                                                  boost::log::attributes::local_clock());
    boost::log::core::get()->set_filter(expr::attr<Severity>("Severity") < WARN);
}

void log(Logger &logger, Severity severity)
{
    BOOST_LOG_SEV(logger, severity)
        << "Client " << PEER_CLIENT << " asked for " << PEER_WISH << " (" << SERIAL << ")";
}

} // namespace

int main(int argc, char **argv)
{
    const Contest contest;
    const std::string file = contest.file("boost");
    Logger logger;
    logTo(file);
    contest.record("boost", file, [&logger] { log(logger, INFO); });
    contest.refusal("boost refused", file, [&logger] { log(logger, WARN); });
    return runBenchmarks(argc, argv);
}

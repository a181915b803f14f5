// SPDX-License-Identifier: Apache-2.0
// Loggers that write records which can be counted afterwards.
#pragma once

#include <cstdint>

#include "process/Job.h"
#include "zelvo.h"

namespace zelvo_test {

/// A formatter class whose record is the message and a line feed: a cheap one leaves more time to
/// meet other processes and threads.
constexpr const char *LINE_FORMATTER = "line_formatter";

/// Registers LINE_FORMATTER; harmless when it is registered.
void addLineFormatter();

/// Makes the logger NAME.log, whose listener NAME.file writes to the file of a job. The caller
/// releases it.
ZlvObject *makeRecordLogger(const char *handlerClass, const Job &job,
                            const std::string &name = "writer");

/// Logs the one text of a record; true when the call succeeds.
bool logRecord(ZlvObject *logger, const Job &job, uint32_t number);

} // namespace zelvo_test

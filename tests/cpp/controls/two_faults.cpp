// SPDX-License-Identifier: Apache-2.0
// A control: the fault that is removed is not the only one.
// expect: zelvo: texts of a message are UTF-16
#include "zelvo_logger.hpp"

void log(const zelvo::Logger &logger);

void log(const zelvo::Logger &logger)
{
    logger.debugMin(u"{0}", "text");
}

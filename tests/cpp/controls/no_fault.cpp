// SPDX-License-Identifier: Apache-2.0
// A control: nothing is wrong here.
// expect: zelvo: texts of a message are UTF-16
#include "zelvo_logger.hpp"

void log(const zelvo::Logger &logger);

void log(const zelvo::Logger &logger)
{
    logger.debugMin(u"{0}", u"text");
}

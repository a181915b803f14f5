// SPDX-License-Identifier: Apache-2.0
// A control: the compiler says something else about the fault.
// expect: zelvo: texts of a message are UTF-16
#include "zelvo_logger.hpp"

void log(const zelvo::Logger &logger);

void log(const zelvo::Logger &logger)
{
#ifdef FAULT_REMOVED
    logger.debugMin(u"{0}", u"text");
#else
    logger.debugMin(u"{0}", nullptr);
#endif
}

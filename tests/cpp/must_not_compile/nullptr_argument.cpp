// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: a message has no place for nullptr
#include "zelvo_logger.hpp"

void log(const zelvo::Logger &logger);

void log(const zelvo::Logger &logger)
{
#ifdef FAULT_REMOVED
    logger.debugMin(u"{0}", u"");
#else
    logger.debugMin(u"{0}", nullptr);
#endif
}

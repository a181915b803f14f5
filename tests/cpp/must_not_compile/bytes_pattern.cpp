// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: a pattern is UTF-16 text that ends with a zero
#include "zelvo_logger.hpp"

void log(const zelvo::Logger &logger);

void log(const zelvo::Logger &logger)
{
#ifdef FAULT_REMOVED
    logger.debugMin(u"text");
#else
    logger.debugMin("text");
#endif
}

// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: a message has no place for a bool
#include "zelvo_logger.hpp"

void log(const zelvo::Logger &logger, bool flag);

void log(const zelvo::Logger &logger, bool flag)
{
#ifdef FAULT_REMOVED
    logger.debugMin(u"{0,number,integer}", [&] { return flag ? 1 : 0; });
#else
    logger.debugMin(u"{0,number,integer}", [&] { return flag; });
#endif
}

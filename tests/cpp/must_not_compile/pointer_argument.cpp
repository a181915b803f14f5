// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: an argument of a message is UTF-16 text, an int32_t or a double
#include "zelvo_logger.hpp"

void log(const zelvo::Logger &logger, const int32_t *number);

void log(const zelvo::Logger &logger, const int32_t *number)
{
#ifdef FAULT_REMOVED
    logger.debugMin(u"{0,number,integer}", *number);
#else
    logger.debugMin(u"{0,number,integer}", number);
#endif
}

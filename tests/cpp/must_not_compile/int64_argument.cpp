// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: {0,number,integer} reads 32 bits with a sign
#include "zelvo_logger.hpp"

void log(const zelvo::Logger &logger, int64_t number);

void log(const zelvo::Logger &logger, int64_t number)
{
#ifdef FAULT_REMOVED
    logger.debugMin(u"{0,number}", static_cast<double>(number));
#else
    logger.debugMin(u"{0,number}", number);
#endif
}

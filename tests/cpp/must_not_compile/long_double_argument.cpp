// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: {0,number} reads a double
#include "zelvo_logger.hpp"

void log(const zelvo::Logger &logger, long double number);

void log(const zelvo::Logger &logger, long double number)
{
#ifdef FAULT_REMOVED
    logger.debugMin(u"{0,number}", static_cast<double>(number));
#else
    logger.debugMin(u"{0,number}", number);
#endif
}

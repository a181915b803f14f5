// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: {0,number,integer} reads 32 bits with a sign
#include "zelvo_logger.hpp"

void log(const zelvo::Logger &logger, int64_t number);

void log(const zelvo::Logger &logger, int64_t number)
{
#ifdef FAULT_REMOVED
    logger.text(u"{0,number,integer}", static_cast<int32_t>(number));
#else
    logger.text(u"{0,number,integer}", number);
#endif
}

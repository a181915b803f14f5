// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: {0,number,integer} reads 32 bits with a sign
#include "zelvo_logger.hpp"

void log(const zelvo::Logger &logger, int64_t number);

void log(const zelvo::Logger &logger, int64_t number)
{
#ifdef FAULT_REMOVED
    logger.info("bundle", "key", static_cast<int32_t>(number));
#else
    logger.info("bundle", "key", number);
#endif
}

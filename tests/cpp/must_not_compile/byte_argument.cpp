// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: a message has no place for a single character or byte
#include "zelvo_logger.hpp"

void log(const zelvo::Logger &logger, uint8_t byte);

void log(const zelvo::Logger &logger, uint8_t byte)
{
#ifdef FAULT_REMOVED
    logger.debugMin(u"{0,number,integer}", static_cast<int32_t>(byte));
#else
    logger.debugMin(u"{0,number,integer}", byte);
#endif
}

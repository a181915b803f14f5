// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: {0,number,integer} reads 32 bits with a sign
#include "zelvo_logger.hpp"

void log(const zelvo::Logger &logger, const std::string &text);

void log(const zelvo::Logger &logger, const std::string &text)
{
#ifdef FAULT_REMOVED
    logger.debugMin(u"{0,number,integer}", static_cast<int32_t>(text.size()));
#else
    logger.debugMin(u"{0,number,integer}", text.size());
#endif
}

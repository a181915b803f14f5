// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: a message has no place for a single character or byte
#include "zelvo_logger.hpp"

void log(const zelvo::Logger &logger, char16_t letter);

void log(const zelvo::Logger &logger, char16_t letter)
{
#ifdef FAULT_REMOVED
    logger.debugMin(u"{0}", std::u16string(1, letter));
#else
    logger.debugMin(u"{0}", letter);
#endif
}

// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: a message has no place for an enumerator
#include "zelvo_logger.hpp"

enum class Colour { RED };

void log(const zelvo::Logger &logger, Colour colour);

void log(const zelvo::Logger &logger, Colour colour)
{
#ifdef FAULT_REMOVED
    logger.debugMin(u"{0,number,integer}", static_cast<int32_t>(colour));
#else
    logger.debugMin(u"{0,number,integer}", colour);
#endif
}

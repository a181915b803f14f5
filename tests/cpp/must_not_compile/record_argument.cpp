// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: an argument of a message is UTF-16 text, an int32_t or a double
#include "zelvo_logger.hpp"

struct Place {
    int32_t x;
};

void log(const zelvo::Logger &logger, Place place);

void log(const zelvo::Logger &logger, Place place)
{
#ifdef FAULT_REMOVED
    logger.debugMin(u"{0,number,integer}", place.x);
#else
    logger.debugMin(u"{0,number,integer}", place);
#endif
}

// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: texts of a message are UTF-16; write u
#include "zelvo_logger.hpp"

void log(const zelvo::Logger &logger, const std::string &text);

void log(const zelvo::Logger &logger, const std::string &text)
{
#ifdef FAULT_REMOVED
    logger.debugMin(u"{0}", zelvo::utf16(text));
#else
    logger.debugMin(u"{0}", text);
#endif
}

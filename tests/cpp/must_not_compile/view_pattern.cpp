// SPDX-License-Identifier: Apache-2.0
// expect: zelvo: a pattern is UTF-16 text that ends with a zero
#include "zelvo_logger.hpp"

void log(const zelvo::Logger &logger, std::u16string_view text);

void log(const zelvo::Logger &logger, std::u16string_view text)
{
#ifdef FAULT_REMOVED
    logger.debugMin(std::u16string(text));
#else
    logger.debugMin(text);
#endif
}

/**
 * @file
 * Formats the text of a log line.
 */
#ifndef KEVRO_LOGFORMAT_H
#define KEVRO_LOGFORMAT_H

#include <cstdarg>

#include "bd/macros.h"
#include "logline.h"

namespace kevro
{

/**
 * Appends what vsprintf() would write.
 *
 * Strings and integers in decimal, without flags, width and precision, take less than half its
 * time. A format with any other conversion is passed to vsnprintf() as a whole.
 *
 * @return whether the arguments could be formatted; if not, part of the text may be appended
 * @throw std::bad_alloc
 */
BD_PRINTF_FORMAT(2, 0)
bool AppendFormatted(TextBuffer& buffer, const char* format, va_list args);

} // namespace kevro

#endif

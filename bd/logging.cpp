#include "bd/logging.h"

#include <cstdarg>

namespace bd
{

void VargLogger::Log(const char* format, ...)
{
    va_list args;
    va_start(args, format);
    KEVRO_Log_VWrite(m_UserId, m_Level, m_HiFreq, format, args);
    va_end(args);
}

} // namespace bd

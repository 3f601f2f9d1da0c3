#include <cstdarg>
#include <cstdlib>
#include <cstring>

#include "bd/logging.h"
#include "kevro/kevro_log.h"
#include "kevro/kevro_osa.h"
#include "kevro_linux.h"
#include "settings.h"

namespace kevro
{

namespace
{

const bool g_AbortOnAssert = ApplyEnvironment("KEVRO_ASSERT", [](const char* text) {
    if (std::strcmp(text, "abort") != 0) {
        Word::Whole(text).Refuse("abort");
    }
});

BD_PRINTF_FORMAT(1, 2) void WriteFatal(const char* format, ...)
{
    va_list args;
    va_start(args, format);
    KEVRO_Log_VWrite(bd::CompIdCommon, KEVRO_Log_LevelFatal, 0, format, args);
    va_end(args);
}

} // namespace

} // namespace kevro

void Assert(const char* expression, const char* file, int line)
{
    kevro::WriteFatal("Assertion failed: %s (%s:%d)", expression, file, line);
    if (kevro::g_AbortOnAssert) {
        KEVRO_Log_Flush();
        std::abort();
    }
}

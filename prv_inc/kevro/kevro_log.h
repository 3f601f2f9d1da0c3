/**
 * @file
 * The platform's log switch and line sink. Plain C (C99) and C++; implemented by a port.
 *
 * Both functions may be called from several threads at once.
 */
#ifndef KEVRO_KEVRO_LOG_H
#define KEVRO_KEVRO_LOG_H

#include <stdarg.h>

#include "kevro/kevro_types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Levels of a log line. The values are those of bd::LogLevelDef.
 *
 * The functions below take a level as an integer, so that a caller may use either enumeration. A C
 * compiler may give this enumeration an unsigned type: cast a variable of it to KEVRO_Int32 where
 * the compiler warns about sign conversions.
 */
typedef enum KEVRO_Log_Level {
    KEVRO_Log_LevelMethod = 0,
    KEVRO_Log_LevelInterface = 1,
    KEVRO_Log_LevelException = 2,
    KEVRO_Log_LevelWarning = 3,
    KEVRO_Log_LevelState = 4,
    KEVRO_Log_LevelEvent = 5,
    KEVRO_Log_LevelInfo = 6,
    KEVRO_Log_LevelFree1 = 7,
    KEVRO_Log_LevelFree2 = 8,
    KEVRO_Log_LevelFree3 = 9,
    KEVRO_Log_LevelFree4 = 10,
    KEVRO_Log_LevelDefault = 11,
    KEVRO_Log_LevelRuntime = 12,
    KEVRO_Log_LevelFatal = 13,
    KEVRO_Log_Level__sizeof = 14 /**< number of levels; not a level */
} KEVRO_Log_Level;

/**
 * Returns whether a line with these attributes would be written.
 *
 * Has no side effects and is cheap enough to be called for every event.
 *
 * @param component a bd::CompIdDef value
 * @param level     a KEVRO_Log_Level or bd::LogLevelDef value
 * @param hiFreq    non-zero for a high-frequency line
 * @return non-zero when the line would be written, 0 otherwise
 */
KEVRO_Bool KEVRO_Log_IsEnabled(KEVRO_UInt32 component, KEVRO_Int32 level, KEVRO_Bool hiFreq);

/**
 * Formats and writes one line; a line that cannot be written is dropped.
 *
 * The caller has called KEVRO_Log_IsEnabled() first; the port need not check again. The function
 * does not throw, and does not keep @p format, @p args or what they point to after it returns.
 *
 * @param component a bd::CompIdDef value
 * @param level     a KEVRO_Log_Level or bd::LogLevelDef value
 * @param hiFreq    non-zero for a high-frequency line
 * @param format    a printf format without a line end
 * @param args      its arguments
 */
#if defined(__GNUC__)
__attribute__((format(printf, 4, 0)))
#endif
void KEVRO_Log_VWrite(KEVRO_UInt32 component, KEVRO_Int32 level, KEVRO_Bool hiFreq,
                      const char* format, va_list args);

#ifdef __cplusplus
}
#endif

#endif

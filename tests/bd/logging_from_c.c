/* Calls of the platform's log functions from C. */
#include "kevro/kevro_log.h"

KEVRO_Bool IsEnabledFromC(void);
void WriteFromC(int ignored, ...);

KEVRO_Bool IsEnabledFromC(void)
{
    const KEVRO_Log_Level variable = KEVRO_Log_LevelEvent;
    return KEVRO_Log_IsEnabled(57, 5, 0) && KEVRO_Log_IsEnabled(57, KEVRO_Log_LevelEvent, 0) &&
           KEVRO_Log_IsEnabled(57, (KEVRO_Int32)variable, 0);
}

void WriteFromC(int ignored, ...)
{
    va_list args;
    va_start(args, ignored);
    KEVRO_Log_VWrite(57, 5, 0, "number %d", args);
    va_end(args);
    va_start(args, ignored);
    KEVRO_Log_VWrite(57, KEVRO_Log_LevelEvent, 0, "number %d", args);
    va_end(args);
}

#include "kevro/kevro_log.h"

/** Passes the platform a format with a conversion that does not exist. */
void WriteUnknownConversion(va_list args)
{
    KEVRO_Log_VWrite(0, KEVRO_Log_LevelEvent, 0, "%y", args);
}

// A log switch that is always off. Included before a source, it removes the source's log lines, so
// that the size without them can be measured.
#include "kevro/kevro_log.h"

__attribute__((always_inline)) inline KEVRO_Bool KEVRO_Log_IsEnabled(KEVRO_UInt32, KEVRO_Int32,
                                                                     KEVRO_Bool)
{
    return 0;
}

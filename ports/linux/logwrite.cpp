#include "kevro/kevro_log.h"
#include "logchannel.h"

void KEVRO_Log_VWrite(KEVRO_UInt32 component, KEVRO_Int32 level, KEVRO_Bool, const char* format,
                      va_list args)
{
    using namespace kevro;
    TheLogChannel().Write({CurrentTime(), component, level}, format, args);
}

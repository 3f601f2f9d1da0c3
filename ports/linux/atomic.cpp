#include "kevro/kevro_osa.h"

// NOLINTNEXTLINE(readability-non-const-parameter): the builtin writes it
KEVRO_Int32 KEVRO_Osa_TaskAtomicAdd(KEVRO_Int32* counter, KEVRO_Int32 delta)
{
    return __atomic_add_fetch(counter, delta, __ATOMIC_SEQ_CST);
}

/*
 * The smallest port: every log line is off, and what must work does.
 *
 * It is C so that it compiles wherever the library does; C++ does as well, with g_u1Bduopmask in
 * the global namespace. ports/README.md says what each function promises.
 */
#include "kevro/kevro_log.h"
#include "kevro/kevro_osa.h"

#include <stdio.h>

/* A real port changes it from its debug console or its settings. */
extern int g_u1Bduopmask;
int g_u1Bduopmask = 0;

/*
 * A real port looks up one bit in a table that its debug console changes: one relaxed atomic load,
 * no lock. It is asked for every event, mostly to answer no.
 */
KEVRO_Bool KEVRO_Log_IsEnabled(KEVRO_UInt32 component, KEVRO_Int32 level, KEVRO_Bool hiFreq)
{
    (void)component;
    (void)level;
    (void)hiFreq;
    return 0;
}

/*
 * A real port formats the line with vsnprintf, puts time, component and level before it, makes
 * control characters harmless and hands it to the system's log without waiting for a slow one.
 */
void KEVRO_Log_VWrite(KEVRO_UInt32 component, KEVRO_Int32 level, KEVRO_Bool hiFreq,
                      const char* format, va_list args)
{
    (void)component;
    (void)level;
    (void)hiFreq;
    (void)format;
    (void)args;
}

/*
 * The one function that cannot be left for later: reference counts rely on it. A compiler without
 * this built-in function has the operating system's atomic addition in its place.
 */
KEVRO_Int32 KEVRO_Osa_TaskAtomicAdd(KEVRO_Int32* counter, KEVRO_Int32 delta)
{
    return __atomic_add_fetch(counter, delta, __ATOMIC_SEQ_CST);
}

/* A real port writes to its log, where the report survives until somebody reads it. */
void Assert(const char* expression, const char* file, int line)
{
    fprintf(stderr, "Assertion failed: %s (%s:%d)\n", expression, file, line);
}

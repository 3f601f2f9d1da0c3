/*
 * The smallest port: every log line is off; only the required functions do anything.
 *
 * It is C so that it compiles wherever the library does; C++ works, too, with g_u1Bduopmask in the
 * global namespace. ports/README.md describes what each function promises.
 */
#include "kevro/kevro_log.h"
#include "kevro/kevro_osa.h"

#include <stdio.h>

/* A real port sets it from its debug console or its settings. */
extern int g_u1Bduopmask;
int g_u1Bduopmask = 0;

/*
 * A real port looks up one bit in a table that its debug console changes: one relaxed atomic load,
 * no lock. It is called for every event, and the answer is mostly no.
 */
KEVRO_Bool KEVRO_Log_IsEnabled(KEVRO_UInt32 component, KEVRO_Int32 level, KEVRO_Bool hiFreq)
{
    (void)component;
    (void)level;
    (void)hiFreq;
    return 0;
}

/*
 * A real port formats the line with vsnprintf, prefixes time, component and level, escapes control
 * characters and passes the line to the system's log without waiting for a slow one.
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
 * The only function that must work from the start: reference counts rely on it. With a compiler
 * that lacks this built-in function, use the operating system's atomic addition.
 */
KEVRO_Int32 KEVRO_Osa_TaskAtomicAdd(KEVRO_Int32* counter, KEVRO_Int32 delta)
{
    return __atomic_add_fetch(counter, delta, __ATOMIC_SEQ_CST);
}

/* A real port writes to its log, where the report survives until it is read. */
void Assert(const char* expression, const char* file, int line)
{
    fprintf(stderr, "Assertion failed: %s (%s:%d)\n", expression, file, line);
}

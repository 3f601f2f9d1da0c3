/**
 * @file
 * Operating-system functions for the layers above. Plain C (C99) and C++; implemented by a port.
 *
 * Both functions may be called from several threads at once.
 */
#ifndef KEVRO_KEVRO_OSA_H
#define KEVRO_KEVRO_OSA_H

#include "kevro/kevro_types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Adds to a counter atomically.
 *
 * The addition is a full memory barrier: a thread's writes before its call are visible to the
 * thread whose later call brings the counter to its final value. Never fails.
 *
 * @param counter the counter, 4-byte aligned, not null
 * @param delta   the value to add; 0 reads the counter
 * @return the value after the addition
 */
KEVRO_Int32 KEVRO_Osa_TaskAtomicAdd(KEVRO_Int32* counter, KEVRO_Int32 delta);

/**
 * Reports a failed assertion and returns; the caller continues with a fallback.
 *
 * A port may be configured to abort the program here instead; the caller makes no provision for
 * that.
 *
 * @param expression the expression that did not hold
 * @param file       the source file, relative to the root of the sources
 * @param line       the line that identifies the assertion
 */
void Assert(const char* expression, const char* file, int line);

#ifdef __cplusplus
}
#endif

#endif

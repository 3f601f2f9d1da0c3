/**
 * @file
 * The configuration of the Linux port's log, which is not part of the platform interface. Plain C
 * (C99) and C++.
 *
 * All functions may be called from several threads at once, while others write log lines, and from
 * constructors and destructors of static objects; none throws. Do not call them from a signal
 * handler, or from the child of a fork() that continues without exec.
 *
 * At start the port reads these environment variables; it reports an unreadable value in one line
 * on standard error and keeps the default:
 *
 * - `KEVRO_LOG`: a text for KEVRO_Log_Configure(); without it `*=Exception|Warning|Fatal`.
 * - `KEVRO_LOG_SINK`: a text for KEVRO_Log_ConfigureSink(); without it `stderr`.
 * - `KEVRO_ASSERT`: `abort` makes Assert() abort the program after its report is written; without
 *   it Assert() returns.
 * - `KEVRO_UOPMASK`: a number that presets `g_u1Bduopmask`; without it 0.
 */
#ifndef KEVRO_LINUX_H
#define KEVRO_LINUX_H

#include <stdbool.h>
#include <stddef.h>

#include "kevro/kevro_types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * Decides which lines are written from now on.
 *
 * The text is a list, separated by commas, of `COMPONENT=LEVEL[|LEVEL...]`. Components and levels
 * are named as in bd::CompIdDef and bd::LogLevelDef without their prefixes; `*` means all.
 * `+hifreq` after a level switches on its high-frequency lines as well. Blanks around words are
 * ignored.
 *
 * @code
 * BdmvNavigator=Event+hifreq|Warning, *=Fatal
 * @endcode
 *
 * The text is the whole configuration: anything it does not name is off, and the empty text
 * switches everything off. A named component gets exactly the levels of its own entries, which add
 * up; `*` applies to all others, wherever it appears.
 *
 * An unreadable text is refused as a whole, and the configuration in force stays. Calls on several
 * threads are applied one after the other.
 *
 * @param text        null is refused
 * @param message     receives the reason of a refusal: the word, its position and what was
 *                    expected there; empty on success. Cut to fit; may be null.
 * @param messageSize bytes at @p message
 * @return whether the text is in force
 */
bool KEVRO_Log_Configure(const char* text, char* message, size_t messageSize);

/**
 * Decides where lines go from now on.
 *
 * The text is one of the following, each with the option `,queue=LINES`:
 * - `stderr`: standard error.
 * - `file:PATH[,size=BYTES][,files=N]`: a file, to which lines are appended. A line that would make
 *   it larger than BYTES (default 1048576) starts a new file; the newest N (default 3) old files
 *   are kept, numbered from 1 before the extension. Its directory must exist. PATH must not
 *   contain a comma.
 * - `syslog[:IDENT]`: the system's logger, facility user, under the name IDENT or, without it, the
 *   program's.
 *
 * Without a queue, the call that logs returns after the line is written. With a queue, it never
 * waits for the sink: a separate thread writes, and when LINES (1 to 65536) lines are waiting, the
 * oldest is dropped.
 *
 * Returns after the previous sink has written all its lines. An unreadable text, or a file that
 * cannot be opened, is refused, and the sink in force stays. Parameters and result are those of
 * KEVRO_Log_Configure().
 */
bool KEVRO_Log_ConfigureSink(const char* text, char* message, size_t messageSize);

/**
 * Makes lines show the time of a clock of the program, such as the position of a simulation.
 *
 * While a clock is set, a line begins with the clock's time as hours, minutes, seconds and
 * microseconds, `00:01:30.500000`, instead of the local date and time. A line keeps the time at
 * which it was logged, however long it waits in a queue. The system's logger shows its own time.
 *
 * Returns when no thread is calling the previous clock, so that what it uses may be destroyed.
 *
 * @param microseconds returns the time since the clock's zero, of which no more than 292 years are
 *                     shown. It is called for every line, on the thread that logs, by one thread
 *                     at a time; it must not log or call functions of this header. Null returns to
 *                     the local date and time.
 * @param user         passed to @p microseconds
 */
void KEVRO_Log_SetClock(KEVRO_UInt64 (*microseconds)(void* user), void* user);

/**
 * The number of lines lost since the start: dropped by a full queue, or rejected by the sink.
 *
 * Never decreases. A log line reports the loss, too, as soon as the queue has caught up or the sink
 * accepts lines again. The first line that a sink rejects is reported at once, with the system's
 * reason, in one line on standard error.
 */
KEVRO_UInt64 KEVRO_Log_GetDroppedLines(void);

/**
 * Waits until every line logged before the call is written or dropped.
 *
 * The end of the program, by exit() or by return from main(), does the same.
 */
void KEVRO_Log_Flush(void);

#ifdef __cplusplus
}
#endif

#endif

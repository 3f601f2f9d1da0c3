/**
 * @file
 * What the Linux port offers beside the platform interface: its log is configured here. Plain C
 * (C99) and C++.
 *
 * All functions may be called from several threads at once, while others write log lines, and from
 * constructors and destructors of static objects; none throws. They belong neither into a signal
 * handler nor into the child of a fork() that goes on without exec.
 *
 * At start the port reads these environment variables; what it cannot read it reports in one line
 * on standard error and leaves at its default:
 *
 * - `KEVRO_LOG`: a text for KEVRO_Log_Configure(); without it `*=Exception|Warning|Fatal`.
 * - `KEVRO_LOG_SINK`: a text for KEVRO_Log_ConfigureSink(); without it `stderr`.
 * - `KEVRO_ASSERT`: `abort` makes Assert() end the program when its report is out; without it
 *   Assert() returns.
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
 * are named as in bd::CompIdDef and bd::LogLevelDef without their prefixes; `*` stands for all.
 * `+hifreq` after a level switches on its high-frequency lines as well. Blanks around words do not
 * count.
 *
 * @code
 * BdmvNavigator=Event+hifreq|Warning, *=Fatal
 * @endcode
 *
 * The text is the whole configuration: what it does not name is off, and the empty text switches
 * everything off. A component that is named gets exactly the levels of its own entries, which add
 * up; `*` governs all the others, wherever it stands.
 *
 * A text that cannot be read is refused whole, and the configuration in force stays. Of calls on
 * several threads one is applied after the other.
 *
 * @param text        null is refused
 * @param message     receives why the text was refused: the word, its position and what was
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
 * - `file:PATH[,size=BYTES][,files=N]`: a file that is appended to. When a line would take it
 * beyond BYTES (1048576 unless given), it is renamed and a new one begun; the N (3 unless given)
 * youngest of the renamed are kept, numbered from 1 before the extension. Missing directories are
 * made. PATH has no comma.
 * - `syslog[:IDENT]`: the system's logger, facility user, under the name IDENT or, without it, the
 *   program's.
 *
 * Without a queue a line is out when its writer goes on. With one, writers never wait for the sink:
 * a thread writes, and when LINES (1 to 65536) lines wait, the oldest of them is dropped.
 *
 * Returns when all lines given to the sink before are out. A text that cannot be read, or a file
 * that cannot be opened, is refused and the sink in force stays. Parameters and result are those of
 * KEVRO_Log_Configure().
 */
bool KEVRO_Log_ConfigureSink(const char* text, char* message, size_t messageSize);

/**
 * How many lines were lost since the start: dropped by a full queue, or refused by the sink.
 *
 * Never decreases. The log tells it too, in a line of its own, as soon as the queue has caught up
 * or the sink takes lines again.
 */
KEVRO_UInt64 KEVRO_Log_GetDroppedLines(void);

/**
 * Waits until every line written before the call is out, as far as it was not dropped.
 *
 * The end of the program, by exit() or by return from main(), does the same.
 */
void KEVRO_Log_Flush(void);

#ifdef __cplusplus
}
#endif

#endif

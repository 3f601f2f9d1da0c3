/**
 * @file
 * Session scripts: the viewer's operations and their times.
 *
 * A script is a text with one command per line. `#` begins a comment, blank lines are ignored, and
 * words are separated by blanks. A line may begin with the time of the session at which it is
 * carried out:
 *
 *     play
 *     at 00:01:30.500 chapter next    # at this time of the session
 *     after 2s pause                  # this long after the previous line
 *     continue                        # at the time of the previous line
 *
 * Times are hours, minutes, seconds and a fraction, of which all but the seconds may be omitted
 * ("1:02:03.5", "02:03", "3.25"), or numbers with a unit ("2s", "500ms", "1.5m", "1h"). They have
 * up to three decimals and must be whole milliseconds.
 */
#ifndef DESKPLAYER_SESSION_SCRIPT_H
#define DESKPLAYER_SESSION_SCRIPT_H

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "deskplayer/errors.h"
#include "deskplayer/ticks.h"

namespace deskplayer
{

/** Longest script that is read, in bytes. */
constexpr std::size_t LongestScript = std::size_t{1024} * 1024;

/** Latest time of a session, and greatest value of a TIME. */
constexpr Ticks LongestSession = std::chrono::hours(1000);

/** Greatest value of a NUMBER. */
constexpr std::uint64_t GreatestNumber = 65535;

/**
 * The pattern of a command: literal words, and placeholders in capitals for values.
 *
 *     "chapter next"    "chapter NUMBER"    "seek TIME"
 *
 * NUMBER is a decimal number from 0 to 65535, TIME a time as above, given in 45 kHz ticks.
 * CALLBACK is the name of a callback. "[ARGUMENT=VALUE ...]", only at the end, is any number of
 * arguments of a callback. The first word is neither "at" nor "after".
 *
 * Patterns may share their first words, and one may be a prefix of another. If several match a
 * line, the first in the table is used.
 */
struct CommandSyntax {
    std::string_view pattern;
    std::string_view help; ///< a short description of the command
};

/** A command to carry out. */
struct ScriptStep {
    Ticks time{0};                     ///< of the session; never decreases
    std::size_t command = 0;           ///< index of its syntax
    std::vector<std::uint64_t> values; ///< of NUMBER and TIME, in order
    std::vector<std::string> words;    ///< of CALLBACK and ARGUMENT=VALUE, in order
    std::size_t line = 0;              ///< from 1
};

/**
 * A script is malformed. what() is one line without control characters: the file, the line, the
 * column in bytes, and the problem.
 *
 *     evening.session:3:9: unexpected 'nxt'; expected next, previous or a NUMBER
 */
class ScriptError : public SessionError
{
public:
    /**
     * @param fileName may contain any bytes
     * @param line     from 1
     * @param column   from 1
     * @param problem  printable text
     */
    ScriptError(const std::string& fileName, std::size_t line, std::size_t column,
                const std::string& problem);
};

/**
 * Reads a script.
 *
 * A byte order mark at the start is ignored. Lines end in LF or CR LF, which the last line may
 * lack. Comments may contain any bytes except control characters. Time and memory are linear in the
 * length of the text.
 *
 * @param text     the whole script
 * @param fileName for messages
 * @param syntaxes all commands; their patterns are used only during the call
 * @param callbacks the names that are valid as CALLBACK; if there are none, any word is
 * @throw ScriptError for the first malformed line; the message lists what is valid there
 */
std::vector<ScriptStep> ParseScript(std::string_view text, const std::string& fileName,
                                    const std::vector<CommandSyntax>& syntaxes,
                                    const std::vector<std::string_view>& callbacks = {});

} // namespace deskplayer

#endif

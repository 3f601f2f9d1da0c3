/**
 * @file
 * Session scripts: what a viewer does, and when.
 *
 * A script is a text of one command a line. `#` begins a comment, blank lines do not count, words
 * are separated by blanks. A line may begin with the time of the session at which it is carried
 * out:
 *
 *     play
 *     at 00:01:30.500 chapter next    # at this time of the session
 *     after 2s pause                  # this long after the line before
 *     continue                        # together with the line before
 *
 * Times are hours, minutes, seconds and milliseconds, of which all but the seconds may be left out
 * ("1:02:03.5", "02:03", "3.25"), or numbers with a unit ("2s", "500ms", "1.5m", "1h"). They have
 * up to three decimals and are whole milliseconds.
 */
#ifndef DESKPLAYER_SESSION_SCRIPT_H
#define DESKPLAYER_SESSION_SCRIPT_H

#include <cstddef>
#include <cstdint>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

#include "text/ticks.h"

namespace deskplayer
{

/** Longest script that is read, in bytes. */
constexpr std::size_t LongestScript = std::size_t{1024} * 1024;

/** Latest time of a session, and greatest value of a TIME. */
constexpr Ticks LongestSession = std::chrono::hours(1000);

/** Greatest value of a NUMBER. */
constexpr std::uint64_t GreatestNumber = 65535;

/**
 * How a command is written: words as they stand, and placeholders in capitals for values.
 *
 *     "chapter next"    "chapter NUMBER"    "seek TIME"
 *
 * NUMBER is a decimal number from 0 to 65535, TIME a time as above, given in ticks of 45 kHz. The
 * first word is neither "at" nor "after".
 *
 * Patterns may begin alike, and one may be the beginning of another. Of several that fit a line,
 * the first in the table counts.
 */
struct CommandSyntax {
    std::string_view pattern;
    std::string_view help; ///< what the command does, in a few words
};

/** A command that is to be carried out. */
struct ScriptStep {
    Ticks time{0};                     ///< of the session; never decreases
    std::size_t command = 0;           ///< index of its syntax
    std::vector<std::uint64_t> values; ///< of the placeholders, in order
    std::size_t line = 0;              ///< from 1
};

/**
 * A script that cannot be read. what() is one line without control characters: the file, the line,
 * the column in bytes, what is wrong.
 *
 *     evening.session:3:9: 'nxt' is no command here; expected next, previous or a NUMBER
 */
class ScriptError : public std::runtime_error
{
public:
    /**
     * @param fileName can hold any bytes
     * @param line     from 1
     * @param column   from 1
     * @param problem  is printable
     */
    ScriptError(const std::string& fileName, std::size_t line, std::size_t column,
                const std::string& problem);
};

/**
 * Reads a script.
 *
 * Lines end in LF or CR LF, the last one may lack it. Comments may hold any bytes but control
 * characters. Time and memory grow with the length of the text.
 *
 * @param text     the whole of it
 * @param fileName for messages
 * @param syntaxes all commands there are; their patterns are looked at during the call only
 * @throw ScriptError the first line that is wrong, with all that would have been right in its place
 */
std::vector<ScriptStep> ParseScript(std::string_view text, const std::string& fileName,
                                    const std::vector<CommandSyntax>& syntaxes);

} // namespace deskplayer

#endif

/**
 * @file
 * Callbacks for people to read.
 */
#ifndef DESKPLAYER_OUTPUT_TEXTOUTPUT_H
#define DESKPLAYER_OUTPUT_TEXTOUTPUT_H

#include <string_view>
#include <vector>

#include "output/argumentstext.h"
#include "output/output.h"

namespace deskplayer
{

/**
 * Writes one line per callback: the time of the session, the callback, and its arguments by name.
 *
 *     00:00:20.000  Stepped                     position=00:00:20.041 direction=Forward
 *
 * A gap is written like a callback, with its name in parentheses:
 *
 *     00:00:58.000  (gap)                       lost=2 cause=capacity
 *
 * So is the name of a start:
 *
 *     00:00:00.000  (start) at 2024-05-31 20:15:00.123456
 *
 * The callback has the colour of its interface; times and names of arguments are dim.
 */
class TextOutput : public Output
{
public:
    /**
     * @param stream   does not throw; it and @p clock must outlive the output
     * @param coloured whether to write the terminal's control sequences for colours
     */
    TextOutput(std::ostream& stream, const VirtualClock& clock, const OutputFilter& filter,
               bool coloured);

private:
    void Write(const CallbackRecord& record) override;
    void Write(const GapRecord& gap) override;
    void Write(const StartRecord& start) override;
    void WriteLine(Ticks time, std::string_view name, const char* colour,
                   const std::vector<ArgumentText>& arguments);
    void Paint(std::string_view text, const char* colour);

    bool m_Coloured;
};

/**
 * Whether a user wants colours on an open file: it is a terminal that has them, and the environment
 * does not turn colours off.
 *
 * @param fileDescriptor of the file
 * @param noColor        value of the environment variable NO_COLOR, which turns colours off unless
 *                       it is empty; null if it is not set
 * @param terminal       value of the environment variable TERM; null if it is not set. A terminal
 *                       named "dumb" has no colours.
 */
bool WantsColours(int fileDescriptor, const char* noColor, const char* terminal);

} // namespace deskplayer

#endif

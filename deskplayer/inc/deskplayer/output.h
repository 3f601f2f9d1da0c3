/**
 * @file
 * Writes the callbacks of a desk, as `bdmv-deskplayer` does.
 *
 * @code
 * std::ostringstream text;
 * {
 *     deskplayer::OutputOptions options;
 *     options.callbacks = "Paused,Continued";
 *     const deskplayer::DeskOutput output(desk, text, options);
 *     deskplayer::PlayFromStartToEnd(desk);
 * }
 * EXPECT_EQ(text.str(), "00:00:20.000  Paused\n");
 * @endcode
 *
 * The output is complete after the object is destroyed: a trace lacks its end before.
 */
#ifndef DESKPLAYER_INC_DESKPLAYER_OUTPUT_H
#define DESKPLAYER_INC_DESKPLAYER_OUTPUT_H

#include <memory>
#include <ostream>
#include <string>
#include <vector>

#include "deskplayer/desk.h"

namespace deskplayer
{

class Output;

/** What to write, and how. */
struct OutputOptions {
    std::string format = "text"; ///< "text", "json" or "trace"
    std::string interfaces;      ///< only their callbacks: "control,settings"; empty for all
    std::string callbacks;       ///< only these: "Paused,AudioInfo"; empty for all
    bool coloured = false;       ///< with a terminal's colours; for text only

    /** "NAME=VALUE" each: what identifies the recording among others; for json only. */
    std::vector<std::string> tags;
};

/** A listener that is registered while it exists, and writes every callback that it receives. */
class DeskOutput
{
public:
    /**
     * @param desk   outlives the output
     * @param stream outlives the output and does not throw; its state shows whether writing
     *               succeeded. It is written to inside callbacks, and never flushed.
     * @throw std::invalid_argument names the unknown word of the options, and a similar one or all
     *        valid ones; or the malformed tag; or the format is "html", which only the program
     * writes
     */
    DeskOutput(Desk& desk, std::ostream& stream, const OutputOptions& options = {});

    /** Not inside a callback. */
    ~DeskOutput();
    DeskOutput(const DeskOutput&) = delete;
    DeskOutput& operator=(const DeskOutput&) = delete;

private:
    Desk& m_rDesk;
    const std::unique_ptr<Output> m_pOutput;
};

} // namespace deskplayer

#endif

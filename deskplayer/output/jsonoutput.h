/**
 * @file
 * Callbacks for programs, one JSON object per line.
 */
#ifndef DESKPLAYER_OUTPUT_JSONOUTPUT_H
#define DESKPLAYER_OUTPUT_JSONOUTPUT_H

#include <string>

#include "output/output.h"
#include "output/tags.h"

namespace deskplayer
{

/**
 * Writes one JSON object per callback, gap or start, each on its own line. docs/outputs.md
 * describes the members.
 *
 *     {"ticks":900000,"time":"00:00:20.000","interface":"control","callback":"Paused","arguments":{}}
 *
 * Every object has the tags of the output and those of its record, in one member. A tag of the
 * output replaces one of the record with the same name.
 */
class JsonOutput : public Output
{
public:
    /** @copydoc Output::Output @param tags of every object */
    JsonOutput(std::ostream& stream, const VirtualClock& clock, const OutputFilter& filter,
               Tags tags = {});

private:
    void Write(const CallbackRecord& record) override;
    void Write(const GapRecord& gap) override;
    void Write(const StartRecord& start) override;
    void WriteLine(const Tags& ofRecord);

    const Tags m_Tags;
    const std::string m_LineEnd; ///< of a record without tags
    std::string m_Line;          ///< that is being composed, with its end
};

} // namespace deskplayer

#endif

/**
 * @file
 * Callbacks for programs, one JSON object per line.
 */
#ifndef DESKPLAYER_OUTPUT_JSONOUTPUT_H
#define DESKPLAYER_OUTPUT_JSONOUTPUT_H

#include "output/output.h"

namespace deskplayer
{

/**
 * Writes one JSON object per callback, gap or start, each on its own line. docs/outputs.md
 * describes the members.
 *
 *     {"ticks":900000,"time":"00:00:20.000","interface":"control","callback":"Paused","arguments":{}}
 */
class JsonOutput : public Output
{
public:
    using Output::Output;

private:
    void Write(const CallbackRecord& record) override;
    void Write(const GapRecord& gap) override;
    void Write(const StartRecord& start) override;
};

} // namespace deskplayer

#endif

/**
 * @file
 * What cannot be read back from a log.
 */
#ifndef TESTS_DESKPLAYER_UNSHOWNARGUMENTS_H
#define TESTS_DESKPLAYER_UNSHOWNARGUMENTS_H

#include <map>
#include <string>
#include <vector>

namespace bdmvtest
{

/** Arguments by callback. */
using ArgumentNames = std::map<std::string, std::vector<std::string>>;

/** The arguments that no line shows. Everything else is in the log. */
inline const ArgumentNames InNoLine = {
    {"AudioInfoChanged",
     {"isPrimary", "format", "sampleRate", "bitsPerSample", "channels", "pid", "channelLayout"}},
    {"ExecuteButton", {"commands"}},
    {"MarkInfo", {"playListId"}},
    {"SystemSuspended", {"data"}},
    {"TriggerSet", {"type", "result"}},
    {"ZoomModeSet", {"clip", "destination", "delay"}},
};

} // namespace bdmvtest

#endif

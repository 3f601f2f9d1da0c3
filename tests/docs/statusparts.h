/**
 * @file
 * The parts of a playback status and the arguments of a callback as texts, by their names.
 */
#ifndef DOCS_STATUSPARTS_H
#define DOCS_STATUSPARTS_H

#include <map>
#include <string>

#include "clientkit/playbackstatus.h"

typedef std::map<std::string, std::string> Texts;

/** A part that is not known is "unknown"; the texts of a part's values are separated by blanks. */
Texts PartsOf(const bdmv::PlaybackStatus& status);

Texts ArgumentsOf(const bdmv::Callback& callback);

#endif

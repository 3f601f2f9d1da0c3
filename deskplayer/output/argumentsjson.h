/**
 * @file
 * The arguments of a callback in JSON.
 */
#ifndef DESKPLAYER_OUTPUT_ARGUMENTSJSON_H
#define DESKPLAYER_OUTPUT_ARGUMENTSJSON_H

#include <nlohmann/json.hpp>

#include "clientkit/callback.h"

namespace deskplayer
{

/**
 * An object with a member for every argument, in order. Positions are in 45 kHz ticks, or null;
 * rectangles are objects.
 */
nlohmann::ordered_json ArgumentsJson(const bdmv::Callback& callback);

} // namespace deskplayer

#endif

/**
 * @file
 * The arguments of a callback in JSON.
 */
#ifndef DESKPLAYER_OUTPUT_ARGUMENTSJSON_H
#define DESKPLAYER_OUTPUT_ARGUMENTSJSON_H

#include <nlohmann/json.hpp>

#include "output/record.h"

namespace deskplayer
{

/**
 * An object with a member for every argument that is not absent, in order. Positions are in 45 kHz
 * ticks, or null; rectangles are objects.
 */
nlohmann::ordered_json ArgumentsJson(const CallbackRecord& record);

} // namespace deskplayer

#endif

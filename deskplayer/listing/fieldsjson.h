/**
 * @file
 * Values of a disc in JSON. docs/outputs.md describes the members.
 */
#ifndef DESKPLAYER_LISTING_FIELDSJSON_H
#define DESKPLAYER_LISTING_FIELDSJSON_H

#include <cstddef>
#include <cstdint>
#include <string>

#include <nlohmann/json.hpp>

#include "deskplayer/ticks.h"
#include "disc/aspectratios.h"
#include "disc/playlist.h"

namespace deskplayer
{

/** @param name may repeat a reserved code, as the functions of disc/codes.h do */
nlohmann::ordered_json CodeJson(std::uint8_t code, const std::string& name);

nlohmann::ordered_json TimeJson(Ticks time);

/** @param ticks as in the file */
nlohmann::ordered_json TimeJson(std::uint32_t ticks);

/** The forbidden operations are those in the file, regardless of a debug override. */
nlohmann::ordered_json UOMaskJson(std::uint64_t mask);

nlohmann::ordered_json ClipJson(const ClipReference& clip);

/** The streams of a play item by kind. @param playItem from 0 */
nlohmann::ordered_json StreamsJson(const PlayList& playList, std::size_t playItem,
                                   AspectRatios& aspectRatios);

} // namespace deskplayer

#endif

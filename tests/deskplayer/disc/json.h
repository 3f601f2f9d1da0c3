/**
 * @file
 * Converts the reader's values to the form of the discs' expected.json.
 */
#ifndef TESTS_DESKPLAYER_DISC_JSON_H
#define TESTS_DESKPLAYER_DISC_JSON_H

#include <functional>
#include <optional>

#include <nlohmann/json.hpp>

#include "disc/clipinfo.h"
#include "disc/index.h"
#include "disc/movieobject.h"
#include "disc/playlist.h"

namespace deskplayer
{

/** Returns the aspect ratio of a video stream of a play item. */
using AspectRatioLookup =
    std::function<std::optional<std::uint8_t>(std::size_t playItem, const Stream& stream)>;

nlohmann::json ToJson(const Index& index);
nlohmann::json ToJson(const MovieObjects& movieObjects);
nlohmann::json ToJson(const ClipInfo& clipInfo);
nlohmann::json ToJson(const PlayList& playList, const AspectRatioLookup& aspectRatio);

} // namespace deskplayer

#endif

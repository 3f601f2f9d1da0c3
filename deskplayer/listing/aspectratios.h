/**
 * @file
 * Aspect ratios of many streams: each clip is read once.
 */
#ifndef DESKPLAYER_LISTING_ASPECTRATIOS_H
#define DESKPLAYER_LISTING_ASPECTRATIOS_H

#include <cstddef>
#include <cstdint>
#include <map>
#include <optional>
#include <string>

#include "disc/disc.h"

namespace deskplayer
{

/** An aspect ratio as the disc codes it, or why it is not known. */
struct AspectRatio {
    std::optional<std::uint8_t> code;
    std::string reason; ///< one line; empty if there is a code
};

/**
 * Looks up aspect ratios in the clip information of a disc.
 *
 * Disc::AspectRatio() reads the clip information for every stream. This one keeps what it needs of
 * every clip it has read, and takes clip information that cannot be read for a reason, not for an
 * error: a disc with a damaged clip can still be described.
 */
class AspectRatios
{
public:
    /** @param disc must outlive it */
    explicit AspectRatios(const Disc& disc) : m_rDisc(disc) {}

    /** @param playItem from 0; @p stream is one of its streams */
    AspectRatio Find(const PlayList& playList, std::size_t playItem, const Stream& stream);

private:
    struct Clip {
        std::map<std::uint16_t, std::uint8_t> ratios; ///< by the PID of the stream
        std::string problem;                          ///< empty if the clip could be read
    };

    const Clip& Read(const std::string& name);

    const Disc& m_rDisc;
    std::map<std::string, Clip> m_Clips;
};

} // namespace deskplayer

#endif

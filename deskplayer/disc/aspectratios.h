/**
 * @file
 * Aspect ratios of many streams: each clip is read once.
 */
#ifndef DESKPLAYER_DISC_ASPECTRATIOS_H
#define DESKPLAYER_DISC_ASPECTRATIOS_H

#include <cstddef>
#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "disc/disc.h"

namespace deskplayer
{

/** An aspect ratio as the disc codes it, or why it is not known. */
struct AspectRatio {
    std::optional<std::uint8_t> code;
    std::string reason;   ///< one line; empty if there is a code
    bool damaged = false; ///< there is clip information, but it cannot be read
};

/**
 * Looks up aspect ratios in the clip information of a disc. Keeps what it needs of every clip that
 * it has read, which is less than the bytes it was read from.
 *
 * Clip information that cannot be read is a reason here, not an error: a disc with a damaged clip
 * can still be described.
 */
class AspectRatios
{
public:
    /** @param disc must outlive it */
    explicit AspectRatios(const Disc& disc) : m_rDisc(disc) {}

    /**
     * The one of a video stream, from the clip that carries it.
     *
     * @param playItem from 0; @p stream is one of its streams
     */
    AspectRatio Find(const PlayList& playList, std::size_t playItem, const Stream& stream);

private:
    struct Clip {
        std::vector<std::pair<std::uint16_t, std::uint8_t>> ratios; ///< see AspectRatiosOf()
        std::string problem; ///< empty if the clip could be read
        bool damaged = false;
    };

    const Clip& Read(const std::string& name);

    const Disc& m_rDisc;
    std::map<std::string, Clip> m_Clips;
};

} // namespace deskplayer

#endif

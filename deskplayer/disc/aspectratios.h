/**
 * @file
 * Looks up the aspect ratios of streams; reads each clip once.
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

/** The code of an aspect ratio, or the reason why it is unknown. */
struct AspectRatio {
    std::optional<std::uint8_t> code;
    std::string reason; ///< one line; empty if the code is known
};

/** Receive the reason, once for each clip, why its clip information is not used. */
struct ClipInfoHandlers {
    MessageHandler onMissing;    ///< there is no file
    MessageHandler onUnreadable; ///< there is one, but it cannot be read or is damaged
};

/**
 * Looks up aspect ratios in the clip information of a disc. Caches the aspect ratios of every clip
 * it has read, which take less memory than the file.
 *
 * Clip information that cannot be read is reported as a reason, not as an error, so that a disc
 * with a damaged clip can still be described.
 */
class AspectRatios
{
public:
    /** @param disc must outlive this object */
    explicit AspectRatios(const Disc& disc, ClipInfoHandlers handlers = {})
        : m_rDisc(disc), m_Handlers(std::move(handlers))
    {
    }

    /**
     * The aspect ratio of a video stream, from the clip that carries it.
     *
     * @param playItem from 0; @p stream is one of its streams
     */
    AspectRatio Find(const PlayList& playList, std::size_t playItem, const Stream& stream);

private:
    struct Clip {
        std::vector<std::pair<std::uint16_t, std::uint8_t>> ratios; ///< see AspectRatiosOf()
        std::string problem; ///< empty if the clip could be read
    };

    const Clip& Read(const std::string& name);

    const Disc& m_rDisc;
    const ClipInfoHandlers m_Handlers;
    std::map<std::string, Clip> m_Clips;
};

} // namespace deskplayer

#endif

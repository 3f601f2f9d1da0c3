/**
 * @file
 * What play lists refer to in the clip information of a disc.
 */
#ifndef DESKPLAYER_CHECK_CLIPS_H
#define DESKPLAYER_CHECK_CLIPS_H

#include <cstdint>
#include <map>
#include <optional>
#include <string>

#include "disc/clipinfo.h"

namespace deskplayer
{

/** The STC sequences and streams of a clip. */
class ClipContents
{
public:
    explicit ClipContents(const ClipInfo& clipInfo);

    /** The STC sequence with this number within the clip; null if there is none. */
    const StcSequence* FindSequence(std::uint8_t number) const;

    /** The coding type of the stream with this PID; nothing if there is none. */
    std::optional<std::uint8_t> FindCodingType(std::uint16_t pid) const;

private:
    std::map<unsigned, StcSequence> m_Sequences;
    std::map<std::uint16_t, std::uint8_t> m_CodingTypes;
};

/** By name; nothing for clip information that cannot be read. */
using Clips = std::map<std::string, std::optional<ClipContents>>;

} // namespace deskplayer

#endif

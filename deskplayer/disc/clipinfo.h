/**
 * @file
 * CLIPINF/nnnnn.clpi: the contents of a clip.
 */
#ifndef DESKPLAYER_DISC_CLIPINFO_H
#define DESKPLAYER_DISC_CLIPINFO_H

#include <cstdint>
#include <string>
#include <utility>
#include <vector>

#include "deskplayer/ticks.h"
#include "disc/bytereader.h"
#include "disc/streamattributes.h"

namespace deskplayer
{

/** A part of the clip with a continuous time line. Times are in 45 kHz ticks. */
struct StcSequence {
    std::uint16_t pcrPid = 0; ///< PID of the clock reference
    std::uint32_t firstPacket = 0;
    std::uint32_t presentationStart = 0;
    std::uint32_t presentationEnd = 0; ///< end of the last picture
};

struct AtcSequence {
    std::uint32_t firstPacket = 0;
    std::uint8_t firstStcSequence = 0; ///< number of its first STC sequence in the clip
    std::vector<StcSequence> stcSequences;
};

/** A stream of a program. */
struct ProgramStream {
    std::uint16_t pid = 0;
    StreamAttributes attributes;
    std::uint8_t aspectRatio = 0; ///< video
    bool captionFlag = false;     ///< video
};

struct Program {
    std::uint32_t firstPacket = 0;
    std::uint16_t programMapPid = 0;
    std::vector<ProgramStream> streams;
};

struct ClipInfo {
    std::string version;
    std::uint8_t clipStreamType = 0;
    std::uint8_t applicationType = 0;   ///< 1: main path of a movie
    bool arrivalTimeOffsets = false;    ///< an arrival time offset table exists
    std::uint32_t greatestDataRate = 0; ///< bytes per second
    std::uint32_t packets = 0;          ///< packets of 192 bytes in the clip file
    std::vector<AtcSequence> atcSequences;
    std::vector<Program> programs;
};

/**
 * Reads clip information. Characteristic points, clip marks and extension data are skipped.
 *
 * @param fileName for messages
 * @throw FormatError wrong type or version, an address outside the file or in its header, a
 *        structure that is longer than the enclosing one or shorter than its own content, or an STC
 *        sequence that ends before it starts. Reserved codes and anything after the known content
 *        of a structure are not errors.
 */
ClipInfo ParseClipInfo(const Bytes& bytes, const std::string& fileName);

/** The duration of the clip: the sum over all its STC sequences. */
Ticks Duration(const ClipInfo& clipInfo);

/**
 * PIDs and aspect ratios of the video streams, in ascending order of PID. If several streams have
 * the same PID, the first is used.
 */
std::vector<std::pair<std::uint16_t, std::uint8_t>> AspectRatiosOf(const ClipInfo& clipInfo);

} // namespace deskplayer

#endif

/**
 * @file
 * index.bdmv: the titles of a disc.
 */
#ifndef DESKPLAYER_DISC_INDEX_H
#define DESKPLAYER_DISC_INDEX_H

#include <cstdint>
#include <string>
#include <vector>

#include "disc/bytereader.h"

namespace deskplayer
{

constexpr std::uint8_t ObjectTypeMovieObject = 1;
constexpr std::uint8_t ObjectTypeJavaObject = 2;

/** The program of first playback, the top menu or a title. */
struct IndexObject {
    std::uint8_t objectType = 0;   ///< ObjectTypeMovieObject, ObjectTypeJavaObject or reserved
    std::uint8_t accessType = 0;   ///< 0 if title search is permitted; padding except for titles
    std::uint8_t playbackType = 0; ///< 0 movie, 1 interactive; 2 and 3 the same for Java objects
    std::uint16_t movieObject = 0; ///< number of the movie object, if it is one
    std::string javaObject;        ///< five-character name, if it is a Java object
    std::uint32_t offset = 0;      ///< from the start of the file
};

struct Index {
    std::string version;
    bool stereoscopicOutputPreferred = false; ///< initial output mode preference
    bool stereoscopicContent = false;         ///< stereoscopic content exists
    std::uint8_t videoFormat = 0;             ///< 0 if not stated
    std::uint8_t frameRate = 0;               ///< 0 if not stated
    IndexObject firstPlayback;
    IndexObject topMenu;
    std::vector<IndexObject> titles; ///< the first is title number 1
};

/**
 * Reads index.bdmv. Content provider data and extension data are skipped.
 *
 * @param fileName for messages
 * @throw FormatError wrong type or version, an address outside the file or in its header, or a
 *        structure that is longer than the enclosing one or shorter than its own content. Reserved
 *        codes and anything after the known content of a structure are not errors.
 */
Index ParseIndex(const Bytes& bytes, const std::string& fileName);

} // namespace deskplayer

#endif

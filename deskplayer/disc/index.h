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

/** The program that runs for first playback, top menu or a title. */
struct IndexObject {
    std::uint8_t objectType = 0;   ///< ObjectTypeMovieObject, ObjectTypeJavaObject or reserved
    std::uint8_t accessType = 0;   ///< titles: 0 if the user may search for it; else padding
    std::uint8_t playbackType = 0; ///< 0 movie, 1 interactive; 2 and 3 the same for Java objects
    std::uint16_t movieObject = 0; ///< number of the movie object, if it is one
    std::string javaObject;        ///< five-character name, if it is a Java object
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
 * Reads index.bdmv. Content provider data and extension data are passed over.
 *
 * @param fileName for messages
 * @throw FormatError wrong type or version, an address outside of the file or in its header, a
 *        structure that is longer than what holds it, or shorter than its own content. Reserved
 *        codes and anything behind the known content of a structure are no error.
 */
Index ParseIndex(const Bytes& bytes, const std::string& fileName);

} // namespace deskplayer

#endif

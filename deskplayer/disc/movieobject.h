/**
 * @file
 * MovieObject.bdmv: the programs of the titles.
 */
#ifndef DESKPLAYER_DISC_MOVIEOBJECT_H
#define DESKPLAYER_DISC_MOVIEOBJECT_H

#include <cstdint>
#include <string>
#include <vector>

#include "disc/bytereader.h"

namespace deskplayer
{

/** A program. Its commands are not read. */
struct MovieObject {
    bool resumeIntention = false;
    bool menuCallMask = false;    ///< menu call is forbidden while the program runs
    bool titleSearchMask = false; ///< title search is forbidden while the program runs
    std::uint16_t commandCount = 0;
};

struct MovieObjects {
    std::string version;
    std::vector<MovieObject> objects; ///< numbered from 0
};

/**
 * Reads MovieObject.bdmv. Commands and extension data are skipped.
 *
 * @param fileName for messages
 * @throw FormatError wrong type or version, or fewer objects or commands than declared
 */
MovieObjects ParseMovieObjects(const Bytes& bytes, const std::string& fileName);

} // namespace deskplayer

#endif

/**
 * @file
 * Finds what is wrong with the metadata of a disc.
 */
#ifndef DESKPLAYER_CHECK_CHECK_H
#define DESKPLAYER_CHECK_CHECK_H

#include <cstddef>
#include <functional>
#include <string>

#include "check/fault.h"
#include "disc/disc.h"

namespace deskplayer
{

/**
 * Reads index.bdmv, MovieObject.bdmv, all clip information and all play lists, and checks the
 * references between them. Stricter than playback, which tolerates much of what is reported.
 *
 * A malformed file is one fault: nothing after it can be trusted.
 *
 * @param disc should ignore backup copies, which hide faults
 * @param onFile receives the name of each file before it is read; may be empty
 * @return the number of faults
 */
std::size_t CheckDisc(const Disc& disc, const FaultHandler& onFault,
                      const std::function<void(const std::string& file)>& onFile = {});

} // namespace deskplayer

#endif

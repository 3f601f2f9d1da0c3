/**
 * @file
 * Counts the memory that a test allocates.
 */
#ifndef TESTS_DESKPLAYER_DISC_COUNTINGNEW_H
#define TESTS_DESKPLAYER_DISC_COUNTINGNEW_H

#include <cstddef>

namespace deskplayer
{

/** Sum of the sizes given to operator new so far, on this thread. */
std::size_t AllocatedBytes();

} // namespace deskplayer

#endif

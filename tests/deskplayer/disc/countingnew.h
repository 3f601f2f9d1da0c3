/**
 * @file
 * Counts the memory a test asks for.
 */
#ifndef TESTS_DESKPLAYER_DISC_COUNTINGNEW_H
#define TESTS_DESKPLAYER_DISC_COUNTINGNEW_H

#include <cstddef>

namespace deskplayer
{

/** Sum of the sizes given to operator new so far, on this thread. */
std::size_t BytesAskedFor();

} // namespace deskplayer

#endif

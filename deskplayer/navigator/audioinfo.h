/**
 * @file
 * Audio attributes as listeners get them.
 */
#ifndef DESKPLAYER_NAVIGATOR_AUDIOINFO_H
#define DESKPLAYER_NAVIGATOR_AUDIOINFO_H

#include "bd/types.h"
#include "disc/playlist.h"

namespace deskplayer
{

/**
 * What a play list says about an audio stream. It does not say how many bits a sample has, nor
 * which channels there are beyond two; a decoder would.
 */
bd::AudioInfoType AudioInfoOf(const Stream& stream);

} // namespace deskplayer

#endif

/**
 * @file
 * Audio attributes as listeners receive them.
 */
#ifndef DESKPLAYER_NAVIGATOR_AUDIOINFO_H
#define DESKPLAYER_NAVIGATOR_AUDIOINFO_H

#include "bd/types.h"
#include "disc/playlist.h"

namespace deskplayer
{

/**
 * The attributes of an audio stream in a play list. A play list gives neither the bits per sample
 * nor the layout of more than two channels; only a decoder could.
 */
bd::AudioInfoType AudioInfoOf(const Stream& stream);

} // namespace deskplayer

#endif

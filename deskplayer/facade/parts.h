/**
 * @file
 * The way from a desk to its parts, for the desk player's own code.
 */
#ifndef DESKPLAYER_FACADE_PARTS_H
#define DESKPLAYER_FACADE_PARTS_H

#include "deskplayer/desk.h"
#include "navigator/deskparts.h"

namespace deskplayer
{

/** The parts of @p desk, which live as long as it does. */
DeskParts& PartsOf(Desk& desk);

} // namespace deskplayer

#endif

/**
 * @file
 * The words that select what to write.
 */
#ifndef DESKPLAYER_FACADE_OUTPUTSETTINGS_H
#define DESKPLAYER_FACADE_OUTPUTSETTINGS_H

#include "deskplayer/output.h"
#include "output/outputformat.h"

namespace deskplayer
{

/** @throw std::invalid_argument as DeskOutput does */
OutputSettings ReadOutputOptions(const OutputOptions& options);

} // namespace deskplayer

#endif

/**
 * @file
 * The arguments of a callback in text.
 */
#ifndef DESKPLAYER_OUTPUT_ARGUMENTSTEXT_H
#define DESKPLAYER_OUTPUT_ARGUMENTSTEXT_H

#include <string>

#include "output/callbacklistener.h"

namespace deskplayer
{

/** A value without blanks: "true", "00:01:30.500", "1080p", "1920x1080+0+0". */
std::string TextOf(const ArgumentValue& value);

} // namespace deskplayer

#endif

/**
 * @file
 * The arguments of a callback in text.
 */
#ifndef DESKPLAYER_OUTPUT_ARGUMENTSTEXT_H
#define DESKPLAYER_OUTPUT_ARGUMENTSTEXT_H

#include <string>
#include <vector>

#include "output/record.h"

namespace deskplayer
{

/** An argument of a callback. */
struct ArgumentText {
    const char* name;
    std::string value; ///< without blanks: "true", "00:01:30.500", "1080p", "1920x1080+0+0"
};

/** The arguments that are not absent, in order. */
std::vector<ArgumentText> ArgumentTexts(const CallbackRecord& record);

} // namespace deskplayer

#endif

/**
 * @file
 * What a recorded callback lacks, and what to do about it.
 */
#ifndef DESKPLAYER_RECORDING_ABSENCE_H
#define DESKPLAYER_RECORDING_ABSENCE_H

#include <string>

#include "output/record.h"

namespace deskplayer
{

/** Whether all arguments are known in full. */
bool IsComplete(const CallbackRecord& record);

/** The names of the arguments that are not known in full: "type, result". */
std::string AbsentArguments(const CallbackRecord& record);

/**
 * Declares the neutral values to be known. A block of callbacks::SystemSuspended becomes as long as
 * what is known of it, because its listener would read beyond.
 */
void Fill(CallbackRecord& record);

} // namespace deskplayer

#endif

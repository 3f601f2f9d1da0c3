/**
 * @file
 * Names of values for people to read. A value without a name is given as its number.
 */
#ifndef DESKPLAYER_TEXT_NAMES_H
#define DESKPLAYER_TEXT_NAMES_H

#include <string>
#include <vector>

#include "bd/types.h"
#include "bdmvnavigator/inavcontrollistener.h"
#include "database/uomasktable.h"

namespace deskplayer
{

std::string NameOf(bd::PlayDirectionDef value);
std::string NameOf(bd::PlaySpeedDef value);
std::string NameOf(bd::TriggerType value);
std::string NameOf(bd::VideoFormatType value);
std::string NameOf(bd::VideoAspectRatioType value);
std::string NameOf(bd::AudioFormatType value);
std::string NameOf(bd::AudioSampleRateType value);
std::string NameOf(bd::AudioBitsPerSamplingType value);
std::string NameOf(bd::AudioChannelType value);
std::string NameOf(bd::UserOperationMaskDef value);
std::string NameOf(bdmv::INavControlListener::FinishedReason value);

/** The operations that a mask forbids. */
std::vector<std::string> NamesOf(const bdmv::UOMaskTable& mask);

/** Two hexadecimal digits per byte. */
std::string HexOf(const void* data, bd::UInt32 size);

} // namespace deskplayer

#endif

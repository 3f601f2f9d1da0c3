/**
 * @file
 * Values as a person reads them. A value without a name gives its number.
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

/** The operations that are forbidden. */
std::vector<std::string> NamesOf(const bdmv::UOMaskTable& mask);

/** Two hexadecimal digits a byte. */
std::string HexOf(const void* data, bd::UInt32 size);

} // namespace deskplayer

#endif

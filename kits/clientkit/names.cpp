#include "clientkit/names.h"

#include <cstddef>

namespace bdmv
{

namespace
{

const EnumeratorName<bd::PlayDirectionDef> g_PlayDirections[] = {
    {bd::PlayDirectionForward, "Forward"},
    {bd::PlayDirectionBackward, "Backward"},
};

const EnumeratorName<bd::PlaySpeedDef> g_PlaySpeeds[] = {
    {bd::PlaySpeedSlow5, "Slow5"},   {bd::PlaySpeedSlow4, "Slow4"},
    {bd::PlaySpeedSlow3, "Slow3"},   {bd::PlaySpeedSlow2, "Slow2"},
    {bd::PlaySpeedSlow1, "Slow1"},   {bd::PlaySpeedNormal, "Normal"},
    {bd::PlaySpeedFast1, "Fast1"},   {bd::PlaySpeedFast2, "Fast2"},
    {bd::PlaySpeedFast3, "Fast3"},   {bd::PlaySpeedFast4, "Fast4"},
    {bd::PlaySpeedFast5, "Fast5"},   {bd::PlaySpeedFast6, "Fast6"},
    {bd::PlaySpeedFast7, "Fast7"},   {bd::PlaySpeedFast8, "Fast8"},
    {bd::PlaySpeedFast9, "Fast9"},   {bd::PlaySpeedFast10, "Fast10"},
    {bd::PlaySpeedFast11, "Fast11"}, {bd::PlaySpeedFast12, "Fast12"},
};

const EnumeratorName<bd::TriggerType> g_TriggerTypes[] = {
    {bd::TriggerTypeNone, "TriggerTypeNone"},
    {bd::TriggerTypeTitleOnly, "TriggerTypeTitleOnly"},
    {bd::TriggerTypeCurrentPosition, "TriggerTypeCurrentPosition"},
    {bd::TriggerTypeSpecificPoint, "TriggerTypeSpecificPoint"},
    {bd::TRIGGER_NONE, "TRIGGER_NONE"},
    {bd::TRIGGER_A, "TRIGGER_A"},
    {bd::TRIGGER_B, "TRIGGER_B"},
    {bd::TRIGGER_AB_NONE, "TRIGGER_AB_NONE"},
    {bd::TRIGGER_CHP, "TRIGGER_CHP"},
    {bd::TRIGGER_TITLE, "TRIGGER_TITLE"},
    {bd::TRIGGER_CURPOS, "TRIGGER_CURPOS"},
    {bd::TRIGGER_A_AND_B, "TRIGGER_A_AND_B"},
    {bd::TRIGGER_INVALID, "TRIGGER_INVALID"},
    {bd::TRIGGER_NOTIFY_FROM_CURPOS, "TRIGGER_NOTIFY_FROM_CURPOS"},
};

const EnumeratorName<bd::VideoFormatType> g_VideoFormats[] = {
    {bd::VideoFormatType480i, "480i"}, {bd::VideoFormatType576i, "576i"},
    {bd::VideoFormatType480p, "480p"}, {bd::VideoFormatType1080i, "1080i"},
    {bd::VideoFormatType720p, "720p"}, {bd::VideoFormatType1080p, "1080p"},
    {bd::VideoFormatType576p, "576p"}, {bd::VideoFormatTypeNoInfo, "NoInfo"},
};

const EnumeratorName<bd::VideoAspectRatioType> g_AspectRatios[] = {
    {bd::VideoAspectRatioType4x3, "4:3"},
    {bd::VideoAspectRatioType16x9, "16:9"},
    {bd::VideoAspectRatioType2_21x1, "2.21:1"},
    {bd::VideoAspectRatioTypeNoInfo, "NoInfo"},
};

const EnumeratorName<bd::AudioFormatType> g_AudioFormats[] = {
    {bd::AudioFormatUnknown, "Unknown"},
    {bd::AudioFormatMpeg, "Mpeg"},
    {bd::AudioFormatAc3, "Ac3"},
    {bd::AudioFormatPcm, "Pcm"},
    {bd::AudioFormatAac, "Aac"},
    {bd::AudioFormatDts, "Dts"},
    {bd::AudioFormatLossless, "Lossless"},
    {bd::AudioFormatEac3, "Eac3"},
    {bd::AudioFormatEac3Sec, "Eac3Sec"},
    {bd::AudioFormatDtshdPriNoXll, "DtshdPriNoXll"},
    {bd::AudioFormatDtshdPriXll, "DtshdPriXll"},
    {bd::AudioFormatDtshdSec, "DtshdSec"},
    {bd::AudioFormatDtsEsMatrix_6_1_Chan, "DtsEsMatrix_6_1_Chan"},
    {bd::AudioFormatDtsEsDiscrete_6_1_Chan, "DtsEsDiscrete_6_1_Chan"},
    {bd::AudioFormatDtsEsDiscrete_8_Chan, "DtsEsDiscrete_8_Chan"},
    {bd::AudioFormatDts_96_24, "Dts_96_24"},
    {bd::AudioFormatDts_96_24_Es_Matrix, "Dts_96_24_Es_Matrix"},
    {bd::AudioFormatDtsHd_Es_Matirx_6_1_Chan, "DtsHd_Es_Matirx_6_1_Chan"},
    {bd::AudioFormatDtsHd_Es_Discrete_6_1_Chan, "DtsHd_Es_Discrete_6_1_Chan"},
    {bd::AudioFormatDtsHd_ES_Discrete_8_Chan, "DtsHd_ES_Discrete_8_Chan"},
    {bd::AudioFormatDtsHd_96_24, "DtsHd_96_24"},
    {bd::AudioFormatDtsHd_96_24_Es_Matrix, "DtsHd_96_24_Es_Matrix"},
};

const EnumeratorName<bd::AudioSampleRateType> g_SampleRates[] = {
    {bd::AudioSampleRateUnknown, "Unknown"}, {bd::AudioSampleRate_8000, "8000"},
    {bd::AudioSampleRate_11025, "11025"},    {bd::AudioSampleRate_12000, "12000"},
    {bd::AudioSampleRate_16000, "16000"},    {bd::AudioSampleRate_22050, "22050"},
    {bd::AudioSampleRate_24000, "24000"},    {bd::AudioSampleRate_32000, "32000"},
    {bd::AudioSampleRate_44100, "44100"},    {bd::AudioSampleRate_48000, "48000"},
    {bd::AudioSampleRate_64000, "64000"},    {bd::AudioSampleRate_88200, "88200"},
    {bd::AudioSampleRate_96000, "96000"},    {bd::AudioSampleRate_176400, "176400"},
    {bd::AudioSampleRate_192000, "192000"},
};

const EnumeratorName<bd::AudioBitsPerSamplingType> g_BitsPerSample[] = {
    {bd::AudioBitsPerSamplingTypeInvalid, "Invalid"}, {bd::AudioBitsPerSamplingType8, "8"},
    {bd::AudioBitsPerSamplingType16, "16"},           {bd::AudioBitsPerSamplingType20, "20"},
    {bd::AudioBitsPerSamplingType24, "24"},
};

const EnumeratorName<bd::AudioChannelType> g_AudioChannels[] = {
    {bd::AudioChannelTypeUnknown, "Unknown"},
    {bd::AudioChannelTypeMono, "Mono"},
    {bd::AudioChannelTypeMonoSub, "MonoSub"},
    {bd::AudioChannelTypeDualMono, "DualMono"},
    {bd::AudioChannelTypeStereo, "Stereo"},
    {bd::AudioChannelTypeStereoSub, "StereoSub"},
    {bd::AudioChannelTypeStereoDolbySurround, "StereoDolbySurround"},
    {bd::AudioChannelTypeSurround2CH, "Surround2CH"},
    {bd::AudioChannelTypeSurround, "Surround"},
    {bd::AudioChannelType3_0, "3_0"},
    {bd::AudioChannelType4_0, "4_0"},
    {bd::AudioChannelType4_1, "4_1"},
    {bd::AudioChannelType5_0, "5_0"},
    {bd::AudioChannelType5_1, "5_1"},
    {bd::AudioChannelType6_0, "6_0"},
    {bd::AudioChannelType6_1, "6_1"},
    {bd::AudioChannelType7_0, "7_0"},
    {bd::AudioChannelType7_1, "7_1"},
    {bd::AudioChannelTypeFmMonoNicamMono, "FmMonoNicamMono"},
    {bd::AudioChannelTypeFmMonoNicamStereo, "FmMonoNicamStereo"},
    {bd::AudioChannelTypeFmMonoNicamDual, "FmMonoNicamDual"},
    {bd::AudioChannelTypeMultiCh, "MultiCh"},
    {bd::AudioChannelTypeMulti_1_0_1, "Multi_1_0_1"},
    {bd::AudioChannelTypeMulti_2_1_0, "Multi_2_1_0"},
    {bd::AudioChannelTypeMulti_2_1_1, "Multi_2_1_1"},
    {bd::AudioChannelTypeMulti_2_2_0, "Multi_2_2_0"},
    {bd::AudioChannelTypeMulti_2_2_1, "Multi_2_2_1"},
    {bd::AudioChannelTypeMulti_4_0_0, "Multi_4_0_0"},
    {bd::AudioChannelTypeMulti_4_0_1, "Multi_4_0_1"},
    {bd::AudioChannelTypeMulti_4_1_0, "Multi_4_1_0"},
    {bd::AudioChannelTypeMulti_4_1_1, "Multi_4_1_1"},
    {bd::AudioChannelTypeMulti_4_2_0, "Multi_4_2_0"},
    {bd::AudioChannelTypeMulti_4_2_1, "Multi_4_2_1"},
    {bd::AudioChannelTypeMulti_4_3_0, "Multi_4_3_0"},
    {bd::AudioChannelTypeMulti_4_3_1, "Multi_4_3_1"},
    {bd::AudioChannelTypeMulti_4_4_0, "Multi_4_4_0"},
    {bd::AudioChannelTypeMulti_5_0_0, "Multi_5_0_0"},
    {bd::AudioChannelTypeMulti_5_0_1, "Multi_5_0_1"},
    {bd::AudioChannelTypeMulti_5_1_0, "Multi_5_1_0"},
    {bd::AudioChannelTypeMulti_5_1_1, "Multi_5_1_1"},
    {bd::AudioChannelTypeMulti_5_2_0, "Multi_5_2_0"},
    {bd::AudioChannelTypeMulti_5_2_1, "Multi_5_2_1"},
    {bd::AudioChannelTypeMulti_5_3_0, "Multi_5_3_0"},
    {bd::AudioChannelTypeOthers, "Others"},
};

const EnumeratorName<bd::UserOperationMaskDef> g_UserOperations[] = {
    {bd::UserOperationChapterSearch, "ChapterSearch"},
    {bd::UserOperationTimeSearch, "TimeSearch"},
    {bd::UserOperationSkipToNextPoint, "SkipToNextPoint"},
    {bd::UserOperationSkipBackToPreviousPoint, "SkipBackToPreviousPoint"},
    {bd::UserOperationStop, "Stop"},
    {bd::UserOperationPauseOn, "PauseOn"},
    {bd::UserOperationStillOff, "StillOff"},
    {bd::UserOperationForwardPlay, "ForwardPlay"},
    {bd::UserOperationBackwardPlay, "BackwardPlay"},
    {bd::UserOperationResume, "Resume"},
    {bd::UserOperationMoveUpSelectedButton, "MoveUpSelectedButton"},
    {bd::UserOperationMoveDownSelectedButton, "MoveDownSelectedButton"},
    {bd::UserOperationMoveLeftSelectedButton, "MoveLeftSelectedButton"},
    {bd::UserOperationMoveRightSelectedButton, "MoveRightSelectedButton"},
    {bd::UserOperationSelectButton, "SelectButton"},
    {bd::UserOperationActivateButton, "ActivateButton"},
    {bd::UserOperationSelectButtonAndActivate, "SelectButtonAndActivate"},
    {bd::UserOperationPrimaryAudioStreamNumberChange, "PrimaryAudioStreamNumberChange"},
    {bd::UserOperationAngleNumberChange, "AngleNumberChange"},
    {bd::UserOperationPopupOn, "PopupOn"},
    {bd::UserOperationPopupOff, "PopupOff"},
    {bd::UserOperationPGTextSTEnableDisable, "PGTextSTEnableDisable"},
    {bd::UserOperationPGTextSTStreamNumberChange, "PGTextSTStreamNumberChange"},
    {bd::UserOperationSecondaryVideoEnableDisable, "SecondaryVideoEnableDisable"},
    {bd::UserOperationSecondaryVideoStreamNumberChange, "SecondaryVideoStreamNumberChange"},
    {bd::UserOperationSecondaryAudioEnableDisable, "SecondaryAudioEnableDisable"},
    {bd::UserOperationSecondaryAudioStreamNumberChange, "SecondaryAudioStreamNumberChange"},
    {bd::UserOperationPiPPGTextSTStreamNumberChange, "PiPPGTextSTStreamNumberChange"},
};

const EnumeratorName<INavControlListener::FinishedReason> g_FinishedReasons[] = {
    {INavControlListener::EndOfMedia, "EndOfMedia"},
    {INavControlListener::DataStarvation, "DataStarvation"},
};

template <typename Enumeration, std::size_t count>
EnumeratorNames<Enumeration> All(const EnumeratorName<Enumeration> (&table)[count])
{
    return EnumeratorNames<Enumeration>(table, table + count);
}

} // namespace

template <> EnumeratorNames<bd::PlayDirectionDef> NamesOf<bd::PlayDirectionDef>()
{
    return All(g_PlayDirections);
}

template <> EnumeratorNames<bd::PlaySpeedDef> NamesOf<bd::PlaySpeedDef>()
{
    return All(g_PlaySpeeds);
}

template <> EnumeratorNames<bd::TriggerType> NamesOf<bd::TriggerType>()
{
    return All(g_TriggerTypes);
}

template <> EnumeratorNames<bd::VideoFormatType> NamesOf<bd::VideoFormatType>()
{
    return All(g_VideoFormats);
}

template <> EnumeratorNames<bd::VideoAspectRatioType> NamesOf<bd::VideoAspectRatioType>()
{
    return All(g_AspectRatios);
}

template <> EnumeratorNames<bd::AudioFormatType> NamesOf<bd::AudioFormatType>()
{
    return All(g_AudioFormats);
}

template <> EnumeratorNames<bd::AudioSampleRateType> NamesOf<bd::AudioSampleRateType>()
{
    return All(g_SampleRates);
}

template <> EnumeratorNames<bd::AudioBitsPerSamplingType> NamesOf<bd::AudioBitsPerSamplingType>()
{
    return All(g_BitsPerSample);
}

template <> EnumeratorNames<bd::AudioChannelType> NamesOf<bd::AudioChannelType>()
{
    return All(g_AudioChannels);
}

template <> EnumeratorNames<bd::UserOperationMaskDef> NamesOf<bd::UserOperationMaskDef>()
{
    return All(g_UserOperations);
}

template <>
EnumeratorNames<INavControlListener::FinishedReason> NamesOf<INavControlListener::FinishedReason>()
{
    return All(g_FinishedReasons);
}

} // namespace bdmv

#include "text/names.h"

namespace deskplayer
{

std::string NameOf(bd::PlayDirectionDef value)
{
    switch (value) {
    case bd::PlayDirectionForward:
        return "Forward";
    case bd::PlayDirectionBackward:
        return "Backward";
    }
    return std::to_string(value);
}

std::string NameOf(bd::PlaySpeedDef value)
{
    switch (value) {
    case bd::PlaySpeedSlow5:
        return "Slow5";
    case bd::PlaySpeedSlow4:
        return "Slow4";
    case bd::PlaySpeedSlow3:
        return "Slow3";
    case bd::PlaySpeedSlow2:
        return "Slow2";
    case bd::PlaySpeedSlow1:
        return "Slow1";
    case bd::PlaySpeedNormal:
        return "Normal";
    case bd::PlaySpeedFast1:
        return "Fast1";
    case bd::PlaySpeedFast2:
        return "Fast2";
    case bd::PlaySpeedFast3:
        return "Fast3";
    case bd::PlaySpeedFast4:
        return "Fast4";
    case bd::PlaySpeedFast5:
        return "Fast5";
    case bd::PlaySpeedFast6:
        return "Fast6";
    case bd::PlaySpeedFast7:
        return "Fast7";
    case bd::PlaySpeedFast8:
        return "Fast8";
    case bd::PlaySpeedFast9:
        return "Fast9";
    case bd::PlaySpeedFast10:
        return "Fast10";
    case bd::PlaySpeedFast11:
        return "Fast11";
    case bd::PlaySpeedFast12:
        return "Fast12";
    }
    return std::to_string(value);
}

std::string NameOf(bd::TriggerType value)
{
    switch (value) {
    case bd::TriggerTypeNone:
        return "TriggerTypeNone";
    case bd::TriggerTypeTitleOnly:
        return "TriggerTypeTitleOnly";
    case bd::TriggerTypeCurrentPosition:
        return "TriggerTypeCurrentPosition";
    case bd::TriggerTypeSpecificPoint:
        return "TriggerTypeSpecificPoint";
    case bd::TRIGGER_NONE:
        return "TRIGGER_NONE";
    case bd::TRIGGER_A:
        return "TRIGGER_A";
    case bd::TRIGGER_B:
        return "TRIGGER_B";
    case bd::TRIGGER_AB_NONE:
        return "TRIGGER_AB_NONE";
    case bd::TRIGGER_CHP:
        return "TRIGGER_CHP";
    case bd::TRIGGER_TITLE:
        return "TRIGGER_TITLE";
    case bd::TRIGGER_CURPOS:
        return "TRIGGER_CURPOS";
    case bd::TRIGGER_A_AND_B:
        return "TRIGGER_A_AND_B";
    case bd::TRIGGER_INVALID:
        return "TRIGGER_INVALID";
    case bd::TRIGGER_NOTIFY_FROM_CURPOS:
        return "TRIGGER_NOTIFY_FROM_CURPOS";
    }
    return std::to_string(value);
}

std::string NameOf(bd::VideoFormatType value)
{
    switch (value) {
    case bd::VideoFormatType480i:
        return "480i";
    case bd::VideoFormatType576i:
        return "576i";
    case bd::VideoFormatType480p:
        return "480p";
    case bd::VideoFormatType1080i:
        return "1080i";
    case bd::VideoFormatType720p:
        return "720p";
    case bd::VideoFormatType1080p:
        return "1080p";
    case bd::VideoFormatType576p:
        return "576p";
    case bd::VideoFormatTypeNoInfo:
        return "NoInfo";
    }
    return std::to_string(value);
}

std::string NameOf(bd::VideoAspectRatioType value)
{
    switch (value) {
    case bd::VideoAspectRatioType4x3:
        return "4:3";
    case bd::VideoAspectRatioType16x9:
        return "16:9";
    case bd::VideoAspectRatioType2_21x1:
        return "2.21:1";
    case bd::VideoAspectRatioTypeNoInfo:
        return "NoInfo";
    }
    return std::to_string(value);
}

std::string NameOf(bd::AudioFormatType value)
{
    switch (value) {
    case bd::AudioFormatUnknown:
        return "Unknown";
    case bd::AudioFormatMpeg:
        return "Mpeg";
    case bd::AudioFormatAc3:
        return "Ac3";
    case bd::AudioFormatPcm:
        return "Pcm";
    case bd::AudioFormatAac:
        return "Aac";
    case bd::AudioFormatDts:
        return "Dts";
    case bd::AudioFormatLossless:
        return "Lossless";
    case bd::AudioFormatEac3:
        return "Eac3";
    case bd::AudioFormatEac3Sec:
        return "Eac3Sec";
    case bd::AudioFormatDtshdPriNoXll:
        return "DtshdPriNoXll";
    case bd::AudioFormatDtshdPriXll:
        return "DtshdPriXll";
    case bd::AudioFormatDtshdSec:
        return "DtshdSec";
    case bd::AudioFormatDtsEsMatrix_6_1_Chan:
        return "DtsEsMatrix_6_1_Chan";
    case bd::AudioFormatDtsEsDiscrete_6_1_Chan:
        return "DtsEsDiscrete_6_1_Chan";
    case bd::AudioFormatDtsEsDiscrete_8_Chan:
        return "DtsEsDiscrete_8_Chan";
    case bd::AudioFormatDts_96_24:
        return "Dts_96_24";
    case bd::AudioFormatDts_96_24_Es_Matrix:
        return "Dts_96_24_Es_Matrix";
    case bd::AudioFormatDtsHd_Es_Matirx_6_1_Chan:
        return "DtsHd_Es_Matirx_6_1_Chan";
    case bd::AudioFormatDtsHd_Es_Discrete_6_1_Chan:
        return "DtsHd_Es_Discrete_6_1_Chan";
    case bd::AudioFormatDtsHd_ES_Discrete_8_Chan:
        return "DtsHd_ES_Discrete_8_Chan";
    case bd::AudioFormatDtsHd_96_24:
        return "DtsHd_96_24";
    case bd::AudioFormatDtsHd_96_24_Es_Matrix:
        return "DtsHd_96_24_Es_Matrix";
    }
    return std::to_string(value);
}

std::string NameOf(bd::AudioSampleRateType value)
{
    switch (value) {
    case bd::AudioSampleRateUnknown:
        return "Unknown";
    case bd::AudioSampleRate_8000:
        return "8000";
    case bd::AudioSampleRate_11025:
        return "11025";
    case bd::AudioSampleRate_12000:
        return "12000";
    case bd::AudioSampleRate_16000:
        return "16000";
    case bd::AudioSampleRate_22050:
        return "22050";
    case bd::AudioSampleRate_24000:
        return "24000";
    case bd::AudioSampleRate_32000:
        return "32000";
    case bd::AudioSampleRate_44100:
        return "44100";
    case bd::AudioSampleRate_48000:
        return "48000";
    case bd::AudioSampleRate_64000:
        return "64000";
    case bd::AudioSampleRate_88200:
        return "88200";
    case bd::AudioSampleRate_96000:
        return "96000";
    case bd::AudioSampleRate_176400:
        return "176400";
    case bd::AudioSampleRate_192000:
        return "192000";
    }
    return std::to_string(value);
}

std::string NameOf(bd::AudioBitsPerSamplingType value)
{
    switch (value) {
    case bd::AudioBitsPerSamplingTypeInvalid:
        return "Invalid";
    case bd::AudioBitsPerSamplingType8:
        return "8";
    case bd::AudioBitsPerSamplingType16:
        return "16";
    case bd::AudioBitsPerSamplingType20:
        return "20";
    case bd::AudioBitsPerSamplingType24:
        return "24";
    }
    return std::to_string(value);
}

std::string NameOf(bd::AudioChannelType value)
{
    switch (value) {
    case bd::AudioChannelTypeUnknown:
        return "Unknown";
    case bd::AudioChannelTypeMono:
        return "Mono";
    case bd::AudioChannelTypeMonoSub:
        return "MonoSub";
    case bd::AudioChannelTypeDualMono:
        return "DualMono";
    case bd::AudioChannelTypeStereo:
        return "Stereo";
    case bd::AudioChannelTypeStereoSub:
        return "StereoSub";
    case bd::AudioChannelTypeStereoDolbySurround:
        return "StereoDolbySurround";
    case bd::AudioChannelTypeSurround2CH:
        return "Surround2CH";
    case bd::AudioChannelTypeSurround:
        return "Surround";
    case bd::AudioChannelType3_0:
        return "3_0";
    case bd::AudioChannelType4_0:
        return "4_0";
    case bd::AudioChannelType4_1:
        return "4_1";
    case bd::AudioChannelType5_0:
        return "5_0";
    case bd::AudioChannelType5_1:
        return "5_1";
    case bd::AudioChannelType6_0:
        return "6_0";
    case bd::AudioChannelType6_1:
        return "6_1";
    case bd::AudioChannelType7_0:
        return "7_0";
    case bd::AudioChannelType7_1:
        return "7_1";
    case bd::AudioChannelTypeFmMonoNicamMono:
        return "FmMonoNicamMono";
    case bd::AudioChannelTypeFmMonoNicamStereo:
        return "FmMonoNicamStereo";
    case bd::AudioChannelTypeFmMonoNicamDual:
        return "FmMonoNicamDual";
    case bd::AudioChannelTypeMultiCh:
        return "MultiCh";
    case bd::AudioChannelTypeMulti_1_0_1:
        return "Multi_1_0_1";
    case bd::AudioChannelTypeMulti_2_1_0:
        return "Multi_2_1_0";
    case bd::AudioChannelTypeMulti_2_1_1:
        return "Multi_2_1_1";
    case bd::AudioChannelTypeMulti_2_2_0:
        return "Multi_2_2_0";
    case bd::AudioChannelTypeMulti_2_2_1:
        return "Multi_2_2_1";
    case bd::AudioChannelTypeMulti_4_0_0:
        return "Multi_4_0_0";
    case bd::AudioChannelTypeMulti_4_0_1:
        return "Multi_4_0_1";
    case bd::AudioChannelTypeMulti_4_1_0:
        return "Multi_4_1_0";
    case bd::AudioChannelTypeMulti_4_1_1:
        return "Multi_4_1_1";
    case bd::AudioChannelTypeMulti_4_2_0:
        return "Multi_4_2_0";
    case bd::AudioChannelTypeMulti_4_2_1:
        return "Multi_4_2_1";
    case bd::AudioChannelTypeMulti_4_3_0:
        return "Multi_4_3_0";
    case bd::AudioChannelTypeMulti_4_3_1:
        return "Multi_4_3_1";
    case bd::AudioChannelTypeMulti_4_4_0:
        return "Multi_4_4_0";
    case bd::AudioChannelTypeMulti_5_0_0:
        return "Multi_5_0_0";
    case bd::AudioChannelTypeMulti_5_0_1:
        return "Multi_5_0_1";
    case bd::AudioChannelTypeMulti_5_1_0:
        return "Multi_5_1_0";
    case bd::AudioChannelTypeMulti_5_1_1:
        return "Multi_5_1_1";
    case bd::AudioChannelTypeMulti_5_2_0:
        return "Multi_5_2_0";
    case bd::AudioChannelTypeMulti_5_2_1:
        return "Multi_5_2_1";
    case bd::AudioChannelTypeMulti_5_3_0:
        return "Multi_5_3_0";
    case bd::AudioChannelTypeOthers:
        return "Others";
    }
    return std::to_string(value);
}

std::string NameOf(bd::UserOperationMaskDef value)
{
    switch (value) {
    case bd::UserOperationChapterSearch:
        return "ChapterSearch";
    case bd::UserOperationTimeSearch:
        return "TimeSearch";
    case bd::UserOperationSkipToNextPoint:
        return "SkipToNextPoint";
    case bd::UserOperationSkipBackToPreviousPoint:
        return "SkipBackToPreviousPoint";
    case bd::UserOperationStop:
        return "Stop";
    case bd::UserOperationPauseOn:
        return "PauseOn";
    case bd::UserOperationStillOff:
        return "StillOff";
    case bd::UserOperationForwardPlay:
        return "ForwardPlay";
    case bd::UserOperationBackwardPlay:
        return "BackwardPlay";
    case bd::UserOperationResume:
        return "Resume";
    case bd::UserOperationMoveUpSelectedButton:
        return "MoveUpSelectedButton";
    case bd::UserOperationMoveDownSelectedButton:
        return "MoveDownSelectedButton";
    case bd::UserOperationMoveLeftSelectedButton:
        return "MoveLeftSelectedButton";
    case bd::UserOperationMoveRightSelectedButton:
        return "MoveRightSelectedButton";
    case bd::UserOperationSelectButton:
        return "SelectButton";
    case bd::UserOperationActivateButton:
        return "ActivateButton";
    case bd::UserOperationSelectButtonAndActivate:
        return "SelectButtonAndActivate";
    case bd::UserOperationPrimaryAudioStreamNumberChange:
        return "PrimaryAudioStreamNumberChange";
    case bd::UserOperationAngleNumberChange:
        return "AngleNumberChange";
    case bd::UserOperationPopupOn:
        return "PopupOn";
    case bd::UserOperationPopupOff:
        return "PopupOff";
    case bd::UserOperationPGTextSTEnableDisable:
        return "PGTextSTEnableDisable";
    case bd::UserOperationPGTextSTStreamNumberChange:
        return "PGTextSTStreamNumberChange";
    case bd::UserOperationSecondaryVideoEnableDisable:
        return "SecondaryVideoEnableDisable";
    case bd::UserOperationSecondaryVideoStreamNumberChange:
        return "SecondaryVideoStreamNumberChange";
    case bd::UserOperationSecondaryAudioEnableDisable:
        return "SecondaryAudioEnableDisable";
    case bd::UserOperationSecondaryAudioStreamNumberChange:
        return "SecondaryAudioStreamNumberChange";
    case bd::UserOperationPiPPGTextSTStreamNumberChange:
        return "PiPPGTextSTStreamNumberChange";
    }
    return std::to_string(value);
}

std::string NameOf(bdmv::INavControlListener::FinishedReason value)
{
    switch (value) {
    case bdmv::INavControlListener::EndOfMedia:
        return "EndOfMedia";
    case bdmv::INavControlListener::DataStarvation:
        return "DataStarvation";
    }
    return std::to_string(value);
}

std::vector<std::string> NamesOf(const bdmv::UOMaskTable& mask)
{
    std::vector<std::string> names;
    for (int bit = 0; bit < 8 * bdmv::UOMaskTable::UO_MASK_TABLE_SIZE; ++bit) {
        const auto operation = static_cast<bd::UserOperationMaskDef>(bit);
        if (mask.IsSet(operation)) {
            names.push_back(NameOf(operation));
        }
    }
    return names;
}

std::string HexOf(const void* data, bd::UInt32 size)
{
    static const char digits[] = "0123456789abcdef";
    std::string text;
    for (bd::UInt32 i = 0; i < size; ++i) {
        const bd::UInt8 byte = static_cast<const bd::UInt8*>(data)[i];
        text += digits[byte >> 4];
        text += digits[byte & 0x0F];
    }
    return text;
}

} // namespace deskplayer

/**
 * @file
 * The vocabulary of disc navigation: fixed-width integers, identifiers, the enumerations that
 * events and listener callbacks carry, and the small value structures handed to listeners.
 *
 * Everything here is a plain value: no ownership, freely copied, compared member by member with ==
 * and !=, safe to read from any thread.
 *
 * Enumerations have the fixed underlying type KEVRO_Int32, so a value outside the list, from a disc
 * or from another layer, can be passed on and reported, and no size depends on compiler flags.
 */
#ifndef BD_TYPES_H
#define BD_TYPES_H

#include "kevro/kevro_types.h"

namespace bd
{

typedef KEVRO_UInt8 UInt8;   ///< unsigned, 8 bits
typedef KEVRO_UInt16 UInt16; ///< unsigned, 16 bits
typedef KEVRO_UInt32 UInt32; ///< unsigned, 32 bits
typedef KEVRO_UInt64 UInt64; ///< unsigned, 64 bits
typedef KEVRO_Int32 Int32;   ///< signed, 32 bits
typedef KEVRO_Int64 Int64;   ///< signed, 64 bits

typedef UInt64 TimePosition;      ///< position on the presentation time line
typedef UInt32 Pts;               ///< presentation time stamp
typedef UInt32 Spn;               ///< source packet number
typedef UInt32 PlayListIdDef;     ///< play list number
typedef UInt16 PlayItemIdDef;     ///< play item number within a play list
typedef UInt16 SubPathIdDef;      ///< sub-path number
typedef UInt8 SubPlayItemIdDef;   ///< sub-play-item number
typedef UInt16 PlayListMarkIdDef; ///< play list mark number
typedef UInt16 ChapterNumberDef;  ///< chapter number
typedef UInt16 TitleNumberDef;    ///< title number
typedef UInt16 MovieObjectIdDef;  ///< movie object number
typedef UInt32 ClipInfoIdDef;     ///< clip information number
typedef UInt16 StreamNumberDef;   ///< stream number (audio, video, graphics, subtitle)
typedef UInt8 AngleNumberDef;     ///< angle number
typedef UInt8 AngleIdDef;         ///< angle identifier
typedef UInt16 ButtonId;          ///< button identifier
typedef UInt16 ButtonNumber;      ///< button number
typedef UInt8 PageId;             ///< interactive-graphics page identifier
typedef UInt8 UserStyleNumber;    ///< text-subtitle user style number
typedef UInt8 SoundIdDef;         ///< menu sound identifier
typedef UInt16 Pid;               ///< transport-stream packet identifier
typedef UInt32 ServiceRequestId;  ///< identifier of a service request

/**
 * Direction of playback.
 */
enum PlayDirectionDef : KEVRO_Int32 { PlayDirectionForward = 0, PlayDirectionBackward = 1 };

/**
 * Speed of playback in 18 steps: 5 is normal, lower is slow motion, higher is fast play.
 */
enum PlaySpeedDef : KEVRO_Int32 {
    PlaySpeedSlow5 = 0,
    PlaySpeedSlow4 = 1,
    PlaySpeedSlow3 = 2,
    PlaySpeedSlow2 = 3,
    PlaySpeedSlow1 = 4,
    PlaySpeedNormal = 5,
    PlaySpeedFast1 = 6,
    PlaySpeedFast2 = 7,
    PlaySpeedFast3 = 8,
    PlaySpeedFast4 = 9,
    PlaySpeedFast5 = 10,
    PlaySpeedFast6 = 11,
    PlaySpeedFast7 = 12,
    PlaySpeedFast8 = 13,
    PlaySpeedFast9 = 14,
    PlaySpeedFast10 = 15,
    PlaySpeedFast11 = 16,
    PlaySpeedFast12 = 17
};

/**
 * Kind of a repeat or notification trigger, and state of a repeat. Two families of names share the
 * range of values; both are in use.
 */
enum TriggerType : KEVRO_Int32 {
    TriggerTypeNone = 0,
    TriggerTypeTitleOnly = 1,
    TriggerTypeCurrentPosition = 2,
    TriggerTypeSpecificPoint = 3,
    TRIGGER_NONE = 4,
    TRIGGER_A = 5,
    TRIGGER_B = 6,
    TRIGGER_AB_NONE = 7,
    TRIGGER_CHP = 8,
    TRIGGER_TITLE = 9,
    TRIGGER_CURPOS = 10,
    TRIGGER_A_AND_B = 11,
    TRIGGER_INVALID = 12,
    TRIGGER_NOTIFY_FROM_CURPOS = 13
};

/**
 * Video format, numbered as the disc's video-format field; 15 means no information.
 */
enum VideoFormatType : KEVRO_Int32 {
    VideoFormatType480i = 1,
    VideoFormatType576i = 2,
    VideoFormatType480p = 3,
    VideoFormatType1080i = 4,
    VideoFormatType720p = 5,
    VideoFormatType1080p = 6,
    VideoFormatType576p = 7,
    VideoFormatTypeNoInfo = 15
};

/**
 * Aspect ratio, numbered as the disc's field; 15 means no information.
 */
enum VideoAspectRatioType : KEVRO_Int32 {
    VideoAspectRatioType4x3 = 2,
    VideoAspectRatioType16x9 = 3,
    VideoAspectRatioType2_21x1 = 4,
    VideoAspectRatioTypeNoInfo = 15
};

/**
 * Coding of an audio stream.
 */
enum AudioFormatType : KEVRO_Int32 {
    AudioFormatUnknown = 0,
    AudioFormatMpeg = 1,
    AudioFormatAc3 = 2,
    AudioFormatPcm = 3,
    AudioFormatAac = 4,
    AudioFormatDts = 5,
    AudioFormatLossless = 6,
    AudioFormatEac3 = 7,
    AudioFormatEac3Sec = 8,
    AudioFormatDtshdPriNoXll = 9,
    AudioFormatDtshdPriXll = 10,
    AudioFormatDtshdSec = 11,
    AudioFormatDtsEsMatrix_6_1_Chan = 12,
    AudioFormatDtsEsDiscrete_6_1_Chan = 13,
    AudioFormatDtsEsDiscrete_8_Chan = 14,
    AudioFormatDts_96_24 = 15,
    AudioFormatDts_96_24_Es_Matrix = 16,
    AudioFormatDtsHd_Es_Matirx_6_1_Chan = 17,
    AudioFormatDtsHd_Es_Discrete_6_1_Chan = 18,
    AudioFormatDtsHd_ES_Discrete_8_Chan = 19,
    AudioFormatDtsHd_96_24 = 20,
    AudioFormatDtsHd_96_24_Es_Matrix = 21
};

/**
 * Sample rate of an audio stream; the number in each name is the rate in hertz.
 */
enum AudioSampleRateType : KEVRO_Int32 {
    AudioSampleRateUnknown = 0,
    AudioSampleRate_8000 = 1,
    AudioSampleRate_11025 = 2,
    AudioSampleRate_12000 = 3,
    AudioSampleRate_16000 = 4,
    AudioSampleRate_22050 = 5,
    AudioSampleRate_24000 = 6,
    AudioSampleRate_32000 = 7,
    AudioSampleRate_44100 = 8,
    AudioSampleRate_48000 = 9,
    AudioSampleRate_64000 = 10,
    AudioSampleRate_88200 = 11,
    AudioSampleRate_96000 = 12,
    AudioSampleRate_176400 = 13,
    AudioSampleRate_192000 = 14
};

/**
 * Bits of one audio sample.
 */
enum AudioBitsPerSamplingType : KEVRO_Int32 {
    AudioBitsPerSamplingTypeInvalid = 0,
    AudioBitsPerSamplingType8 = 1,
    AudioBitsPerSamplingType16 = 2,
    AudioBitsPerSamplingType20 = 3,
    AudioBitsPerSamplingType24 = 4
};

/**
 * Channels of an audio stream. In names of the form Multi_f_s_l the numbers count the front, the
 * surround and the low-frequency channels.
 */
enum AudioChannelType : KEVRO_Int32 {
    AudioChannelTypeUnknown = 0,
    AudioChannelTypeMono = 1,
    AudioChannelTypeMonoSub = 2,
    AudioChannelTypeDualMono = 3,
    AudioChannelTypeStereo = 4,
    AudioChannelTypeStereoSub = 5,
    AudioChannelTypeStereoDolbySurround = 6,
    AudioChannelTypeSurround2CH = 7,
    AudioChannelTypeSurround = 8,
    AudioChannelType3_0 = 9,
    AudioChannelType4_0 = 10,
    AudioChannelType4_1 = 11,
    AudioChannelType5_0 = 12,
    AudioChannelType5_1 = 13,
    AudioChannelType6_0 = 14,
    AudioChannelType6_1 = 15,
    AudioChannelType7_0 = 16,
    AudioChannelType7_1 = 17,
    AudioChannelTypeFmMonoNicamMono = 18,
    AudioChannelTypeFmMonoNicamStereo = 19,
    AudioChannelTypeFmMonoNicamDual = 20,
    AudioChannelTypeMultiCh = 21,
    AudioChannelTypeMulti_1_0_1 = 22,
    AudioChannelTypeMulti_2_1_0 = 23,
    AudioChannelTypeMulti_2_1_1 = 24,
    AudioChannelTypeMulti_2_2_0 = 25,
    AudioChannelTypeMulti_2_2_1 = 26,
    AudioChannelTypeMulti_4_0_0 = 27,
    AudioChannelTypeMulti_4_0_1 = 28,
    AudioChannelTypeMulti_4_1_0 = 29,
    AudioChannelTypeMulti_4_1_1 = 30,
    AudioChannelTypeMulti_4_2_0 = 31,
    AudioChannelTypeMulti_4_2_1 = 32,
    AudioChannelTypeMulti_4_3_0 = 33,
    AudioChannelTypeMulti_4_3_1 = 34,
    AudioChannelTypeMulti_4_4_0 = 35,
    AudioChannelTypeMulti_5_0_0 = 36,
    AudioChannelTypeMulti_5_0_1 = 37,
    AudioChannelTypeMulti_5_1_0 = 38,
    AudioChannelTypeMulti_5_1_1 = 39,
    AudioChannelTypeMulti_5_2_0 = 40,
    AudioChannelTypeMulti_5_2_1 = 41,
    AudioChannelTypeMulti_5_3_0 = 42,
    AudioChannelTypeOthers = 43
};

/**
 * User operations, numbered as the bit positions of the disc's 64-bit user operation mask, counted
 * from its most significant bit. Numbers not listed are not assigned.
 */
enum UserOperationMaskDef : KEVRO_Int32 {
    UserOperationChapterSearch = 2,
    UserOperationTimeSearch = 3,
    UserOperationSkipToNextPoint = 4,
    UserOperationSkipBackToPreviousPoint = 5,
    UserOperationStop = 7,
    UserOperationPauseOn = 8,
    UserOperationStillOff = 10,
    UserOperationForwardPlay = 11,
    UserOperationBackwardPlay = 12,
    UserOperationResume = 13,
    UserOperationMoveUpSelectedButton = 14,
    UserOperationMoveDownSelectedButton = 15,
    UserOperationMoveLeftSelectedButton = 16,
    UserOperationMoveRightSelectedButton = 17,
    UserOperationSelectButton = 18,
    UserOperationActivateButton = 19,
    UserOperationSelectButtonAndActivate = 20,
    UserOperationPrimaryAudioStreamNumberChange = 21,
    UserOperationAngleNumberChange = 23,
    UserOperationPopupOn = 24,
    UserOperationPopupOff = 25,
    UserOperationPGTextSTEnableDisable = 26,
    UserOperationPGTextSTStreamNumberChange = 27,
    UserOperationSecondaryVideoEnableDisable = 28,
    UserOperationSecondaryVideoStreamNumberChange = 29,
    UserOperationSecondaryAudioEnableDisable = 30,
    UserOperationSecondaryAudioStreamNumberChange = 31,
    UserOperationPiPPGTextSTStreamNumberChange = 33
};

/**
 * Size of the secondary video window.
 */
enum SecondaryVideoSize : KEVRO_Int32 {
    SecondaryVideoSizeFromMetadata = 0,
    SecondaryVideoSizeFullScreen = 15
};

/**
 * Kind of a sub path, numbered as the disc's sub-path type field.
 */
enum SubPathType : KEVRO_Int32 {
    SubPathAudioPresentationPath = 2,
    SubPathIGPresentationMenu = 3,
    SubPathTSPresentationPath = 4,
    SubPathOutOfMuxSynchPipPresentationPath = 5,
    SubPathOutOfMuxASynchPipPresentationPath = 6,
    SubPathInMuxSynchPipPresentationPath = 7,
    SubPathTypeUndefined = 255
};

/**
 * What happens at the end of a play item, numbered as the disc's still-mode field.
 */
enum StillModeDef : KEVRO_Int32 {
    StillModeNotStill = 0,
    StillModeForFiniteDuration = 1,
    StillModeForInfiniteDuration = 2
};

/**
 * Attributes of an audio stream. Passed to listeners by value; all zero (unknown, invalid) when
 * default-constructed.
 */
struct AudioInfoType {
    AudioFormatType format;                   ///< coding of the stream
    AudioSampleRateType sampleRate;           ///< sampling frequency
    AudioBitsPerSamplingType bitsPerSampling; ///< resolution of a sample
    AudioChannelType channels;                ///< arrangement of the channels
    Pid pid;                                  ///< packet identifier of the stream
    UInt32 u4AudChannelLayout; ///< the decoder's channel-layout word, passed through unchanged

    AudioInfoType()
        : format(AudioFormatUnknown), sampleRate(AudioSampleRateUnknown),
          bitsPerSampling(AudioBitsPerSamplingTypeInvalid), channels(AudioChannelTypeUnknown),
          pid(0), u4AudChannelLayout(0)
    {
    }
};

/**
 * A rectangle of the picture. Neither its unit nor its origin is specified: navigator and clients
 * agree on them.
 */
struct ZoomRectangleDef {
    UInt16 X;      ///< horizontal position
    UInt16 Y;      ///< vertical position
    UInt16 Width;  ///< horizontal extent
    UInt16 Height; ///< vertical extent
};

/** Zoom parameters. Passed to listeners by value. */
struct ZOOM_PARAM_Def {
    ZoomRectangleDef rClipRectangle; ///< the part of the picture to enlarge
    ZoomRectangleDef rDestRectangle; ///< where it is shown
    UInt32 u4Delay;                  ///< passed through unchanged; its unit is unspecified
};

/** The trigger that is set. */
struct Trigger {
    TriggerType triggerType; ///< its kind
};

/** Where a chapter starts. */
struct BDMarkDef {
    TimePosition time; ///< start of the chapter
    UInt16 chpNo;      ///< chapter number
};

/** A block of bytes owned elsewhere. */
struct DataBlockDef {
    UInt8* pData; ///< first byte; not owned
    UInt32 size;  ///< bytes at pData
};

/** A direction paired with a speed. */
class PlayMode
{
public:
    /** Forward at normal speed. */
    PlayMode() : m_Direction(PlayDirectionForward), m_Speed(PlaySpeedNormal) {}

    /** A direction and a speed. */
    PlayMode(PlayDirectionDef direction, PlaySpeedDef speed)
        : m_Direction(direction), m_Speed(speed)
    {
    }

    /** The direction. */
    PlayDirectionDef Direction() const { return m_Direction; }

    /** The speed. */
    PlaySpeedDef Speed() const { return m_Speed; }

private:
    PlayDirectionDef m_Direction;
    PlaySpeedDef m_Speed;
};

/** Whether all members are equal. */
inline bool operator==(const PlayMode& left, const PlayMode& right)
{
    return left.Direction() == right.Direction() && left.Speed() == right.Speed();
}

/** Whether any member differs. */
inline bool operator!=(const PlayMode& left, const PlayMode& right)
{
    return !(left == right);
}

/** Whether all members are equal. */
inline bool operator==(const AudioInfoType& left, const AudioInfoType& right)
{
    return left.format == right.format && left.sampleRate == right.sampleRate &&
           left.bitsPerSampling == right.bitsPerSampling && left.channels == right.channels &&
           left.pid == right.pid && left.u4AudChannelLayout == right.u4AudChannelLayout;
}

/** Whether any member differs. */
inline bool operator!=(const AudioInfoType& left, const AudioInfoType& right)
{
    return !(left == right);
}

/** Whether all members are equal. */
inline bool operator==(const ZoomRectangleDef& left, const ZoomRectangleDef& right)
{
    return left.X == right.X && left.Y == right.Y && left.Width == right.Width &&
           left.Height == right.Height;
}

/** Whether any member differs. */
inline bool operator!=(const ZoomRectangleDef& left, const ZoomRectangleDef& right)
{
    return !(left == right);
}

/** Whether all members are equal. */
inline bool operator==(const ZOOM_PARAM_Def& left, const ZOOM_PARAM_Def& right)
{
    return left.rClipRectangle == right.rClipRectangle &&
           left.rDestRectangle == right.rDestRectangle && left.u4Delay == right.u4Delay;
}

/** Whether any member differs. */
inline bool operator!=(const ZOOM_PARAM_Def& left, const ZOOM_PARAM_Def& right)
{
    return !(left == right);
}

/** Whether all members are equal. */
inline bool operator==(const Trigger& left, const Trigger& right)
{
    return left.triggerType == right.triggerType;
}

/** Whether any member differs. */
inline bool operator!=(const Trigger& left, const Trigger& right)
{
    return !(left == right);
}

/** Whether all members are equal. */
inline bool operator==(const BDMarkDef& left, const BDMarkDef& right)
{
    return left.time == right.time && left.chpNo == right.chpNo;
}

/** Whether any member differs. */
inline bool operator!=(const BDMarkDef& left, const BDMarkDef& right)
{
    return !(left == right);
}

/** Whether both are the same block: same address, same size. The bytes are not compared. */
inline bool operator==(const DataBlockDef& left, const DataBlockDef& right)
{
    return left.pData == right.pData && left.size == right.size;
}

/** See operator==(const DataBlockDef&, const DataBlockDef&). */
inline bool operator!=(const DataBlockDef& left, const DataBlockDef& right)
{
    return !(left == right);
}

// Clients across a binary interface see these layouts. BDMarkDef ends on a 64-bit boundary only on
// targets that align 64-bit members to 8 bytes.
static_assert(sizeof(PlayDirectionDef) == 4, "enumerations are 32 bits wide");
static_assert(sizeof(AudioInfoType) == 24, "layout seen by listeners");
static_assert(alignof(AudioInfoType) == 4, "layout seen by listeners");
static_assert(sizeof(ZoomRectangleDef) == 8, "layout seen by listeners");
static_assert(sizeof(ZOOM_PARAM_Def) == 20, "layout seen by listeners");
static_assert(sizeof(Trigger) == 4, "layout seen by the navigator");
static_assert(sizeof(BDMarkDef) == (alignof(BDMarkDef) == 8 ? 16 : 12),
              "layout seen by the navigator");
static_assert(sizeof(DataBlockDef) == 2 * sizeof(void*), "layout seen by the navigator");
static_assert(sizeof(PlayMode) == 8, "layout seen by the navigator");

} // namespace bd

#endif

// Every enumeration has exactly the enumerators listed here, each with exactly its value: the
// values reach clients, the platform and log lines.

#include <gtest/gtest.h>

#include <type_traits>

#include "bd/logging.h"
#include "bd/types.h"
#include "bdmvnavigator/inavcontrollistener.h"
#include "bdmvnavigator/inaverror.h"
#include "bdstreaming/types.h"
#include "database/inavigationcommanddata.h"
#include "database/iplaylistmark.h"

// An enumerator missing from a list, or a value that two of them share, does not compile.
#pragma GCC diagnostic error "-Wswitch"

#define CASE(enumerator, value) case enumerator:
#define EXPECT_VALUE(enumerator, value) EXPECT_EQ(value, static_cast<long long>(enumerator));

#define TEST_ENUMERATION(Name, Type, LIST)                                                         \
    TEST(Enumerations, Name##HasExactlyItsValues)                                                  \
    {                                                                                              \
        const auto isListed = [](Type value) {                                                     \
            switch (value) {                                                                       \
                LIST(CASE)                                                                         \
                return true;                                                                       \
            }                                                                                      \
            return false;                                                                          \
        };                                                                                         \
        static_cast<void>(isListed);                                                               \
        LIST(EXPECT_VALUE)                                                                         \
    }

#define PLAY_DIRECTIONS(X)                                                                         \
    X(bd::PlayDirectionForward, 0)                                                                 \
    X(bd::PlayDirectionBackward, 1)

#define PLAY_SPEEDS(X)                                                                             \
    X(bd::PlaySpeedSlow5, 0)                                                                       \
    X(bd::PlaySpeedSlow4, 1)                                                                       \
    X(bd::PlaySpeedSlow3, 2)                                                                       \
    X(bd::PlaySpeedSlow2, 3)                                                                       \
    X(bd::PlaySpeedSlow1, 4)                                                                       \
    X(bd::PlaySpeedNormal, 5)                                                                      \
    X(bd::PlaySpeedFast1, 6)                                                                       \
    X(bd::PlaySpeedFast2, 7)                                                                       \
    X(bd::PlaySpeedFast3, 8)                                                                       \
    X(bd::PlaySpeedFast4, 9)                                                                       \
    X(bd::PlaySpeedFast5, 10)                                                                      \
    X(bd::PlaySpeedFast6, 11)                                                                      \
    X(bd::PlaySpeedFast7, 12)                                                                      \
    X(bd::PlaySpeedFast8, 13)                                                                      \
    X(bd::PlaySpeedFast9, 14)                                                                      \
    X(bd::PlaySpeedFast10, 15)                                                                     \
    X(bd::PlaySpeedFast11, 16)                                                                     \
    X(bd::PlaySpeedFast12, 17)

#define TRIGGER_TYPES(X)                                                                           \
    X(bd::TriggerTypeNone, 0)                                                                      \
    X(bd::TriggerTypeTitleOnly, 1)                                                                 \
    X(bd::TriggerTypeCurrentPosition, 2)                                                           \
    X(bd::TriggerTypeSpecificPoint, 3)                                                             \
    X(bd::TRIGGER_NONE, 4)                                                                         \
    X(bd::TRIGGER_A, 5)                                                                            \
    X(bd::TRIGGER_B, 6)                                                                            \
    X(bd::TRIGGER_AB_NONE, 7)                                                                      \
    X(bd::TRIGGER_CHP, 8)                                                                          \
    X(bd::TRIGGER_TITLE, 9)                                                                        \
    X(bd::TRIGGER_CURPOS, 10)                                                                      \
    X(bd::TRIGGER_A_AND_B, 11)                                                                     \
    X(bd::TRIGGER_INVALID, 12)                                                                     \
    X(bd::TRIGGER_NOTIFY_FROM_CURPOS, 13)

#define VIDEO_FORMATS(X)                                                                           \
    X(bd::VideoFormatType480i, 1)                                                                  \
    X(bd::VideoFormatType576i, 2)                                                                  \
    X(bd::VideoFormatType480p, 3)                                                                  \
    X(bd::VideoFormatType1080i, 4)                                                                 \
    X(bd::VideoFormatType720p, 5)                                                                  \
    X(bd::VideoFormatType1080p, 6)                                                                 \
    X(bd::VideoFormatType576p, 7)                                                                  \
    X(bd::VideoFormatTypeNoInfo, 15)

#define VIDEO_ASPECT_RATIOS(X)                                                                     \
    X(bd::VideoAspectRatioType4x3, 2)                                                              \
    X(bd::VideoAspectRatioType16x9, 3)                                                             \
    X(bd::VideoAspectRatioType2_21x1, 4)                                                           \
    X(bd::VideoAspectRatioTypeNoInfo, 15)

#define AUDIO_FORMATS(X)                                                                           \
    X(bd::AudioFormatUnknown, 0)                                                                   \
    X(bd::AudioFormatMpeg, 1)                                                                      \
    X(bd::AudioFormatAc3, 2)                                                                       \
    X(bd::AudioFormatPcm, 3)                                                                       \
    X(bd::AudioFormatAac, 4)                                                                       \
    X(bd::AudioFormatDts, 5)                                                                       \
    X(bd::AudioFormatLossless, 6)                                                                  \
    X(bd::AudioFormatEac3, 7)                                                                      \
    X(bd::AudioFormatEac3Sec, 8)                                                                   \
    X(bd::AudioFormatDtshdPriNoXll, 9)                                                             \
    X(bd::AudioFormatDtshdPriXll, 10)                                                              \
    X(bd::AudioFormatDtshdSec, 11)                                                                 \
    X(bd::AudioFormatDtsEsMatrix_6_1_Chan, 12)                                                     \
    X(bd::AudioFormatDtsEsDiscrete_6_1_Chan, 13)                                                   \
    X(bd::AudioFormatDtsEsDiscrete_8_Chan, 14)                                                     \
    X(bd::AudioFormatDts_96_24, 15)                                                                \
    X(bd::AudioFormatDts_96_24_Es_Matrix, 16)                                                      \
    X(bd::AudioFormatDtsHd_Es_Matirx_6_1_Chan, 17)                                                 \
    X(bd::AudioFormatDtsHd_Es_Discrete_6_1_Chan, 18)                                               \
    X(bd::AudioFormatDtsHd_ES_Discrete_8_Chan, 19)                                                 \
    X(bd::AudioFormatDtsHd_96_24, 20)                                                              \
    X(bd::AudioFormatDtsHd_96_24_Es_Matrix, 21)

#define AUDIO_SAMPLE_RATES(X)                                                                      \
    X(bd::AudioSampleRateUnknown, 0)                                                               \
    X(bd::AudioSampleRate_8000, 1)                                                                 \
    X(bd::AudioSampleRate_11025, 2)                                                                \
    X(bd::AudioSampleRate_12000, 3)                                                                \
    X(bd::AudioSampleRate_16000, 4)                                                                \
    X(bd::AudioSampleRate_22050, 5)                                                                \
    X(bd::AudioSampleRate_24000, 6)                                                                \
    X(bd::AudioSampleRate_32000, 7)                                                                \
    X(bd::AudioSampleRate_44100, 8)                                                                \
    X(bd::AudioSampleRate_48000, 9)                                                                \
    X(bd::AudioSampleRate_64000, 10)                                                               \
    X(bd::AudioSampleRate_88200, 11)                                                               \
    X(bd::AudioSampleRate_96000, 12)                                                               \
    X(bd::AudioSampleRate_176400, 13)                                                              \
    X(bd::AudioSampleRate_192000, 14)

#define AUDIO_BITS_PER_SAMPLING(X)                                                                 \
    X(bd::AudioBitsPerSamplingTypeInvalid, 0)                                                      \
    X(bd::AudioBitsPerSamplingType8, 1)                                                            \
    X(bd::AudioBitsPerSamplingType16, 2)                                                           \
    X(bd::AudioBitsPerSamplingType20, 3)                                                           \
    X(bd::AudioBitsPerSamplingType24, 4)

#define AUDIO_CHANNELS(X)                                                                          \
    X(bd::AudioChannelTypeUnknown, 0)                                                              \
    X(bd::AudioChannelTypeMono, 1)                                                                 \
    X(bd::AudioChannelTypeMonoSub, 2)                                                              \
    X(bd::AudioChannelTypeDualMono, 3)                                                             \
    X(bd::AudioChannelTypeStereo, 4)                                                               \
    X(bd::AudioChannelTypeStereoSub, 5)                                                            \
    X(bd::AudioChannelTypeStereoDolbySurround, 6)                                                  \
    X(bd::AudioChannelTypeSurround2CH, 7)                                                          \
    X(bd::AudioChannelTypeSurround, 8)                                                             \
    X(bd::AudioChannelType3_0, 9)                                                                  \
    X(bd::AudioChannelType4_0, 10)                                                                 \
    X(bd::AudioChannelType4_1, 11)                                                                 \
    X(bd::AudioChannelType5_0, 12)                                                                 \
    X(bd::AudioChannelType5_1, 13)                                                                 \
    X(bd::AudioChannelType6_0, 14)                                                                 \
    X(bd::AudioChannelType6_1, 15)                                                                 \
    X(bd::AudioChannelType7_0, 16)                                                                 \
    X(bd::AudioChannelType7_1, 17)                                                                 \
    X(bd::AudioChannelTypeFmMonoNicamMono, 18)                                                     \
    X(bd::AudioChannelTypeFmMonoNicamStereo, 19)                                                   \
    X(bd::AudioChannelTypeFmMonoNicamDual, 20)                                                     \
    X(bd::AudioChannelTypeMultiCh, 21)                                                             \
    X(bd::AudioChannelTypeMulti_1_0_1, 22)                                                         \
    X(bd::AudioChannelTypeMulti_2_1_0, 23)                                                         \
    X(bd::AudioChannelTypeMulti_2_1_1, 24)                                                         \
    X(bd::AudioChannelTypeMulti_2_2_0, 25)                                                         \
    X(bd::AudioChannelTypeMulti_2_2_1, 26)                                                         \
    X(bd::AudioChannelTypeMulti_4_0_0, 27)                                                         \
    X(bd::AudioChannelTypeMulti_4_0_1, 28)                                                         \
    X(bd::AudioChannelTypeMulti_4_1_0, 29)                                                         \
    X(bd::AudioChannelTypeMulti_4_1_1, 30)                                                         \
    X(bd::AudioChannelTypeMulti_4_2_0, 31)                                                         \
    X(bd::AudioChannelTypeMulti_4_2_1, 32)                                                         \
    X(bd::AudioChannelTypeMulti_4_3_0, 33)                                                         \
    X(bd::AudioChannelTypeMulti_4_3_1, 34)                                                         \
    X(bd::AudioChannelTypeMulti_4_4_0, 35)                                                         \
    X(bd::AudioChannelTypeMulti_5_0_0, 36)                                                         \
    X(bd::AudioChannelTypeMulti_5_0_1, 37)                                                         \
    X(bd::AudioChannelTypeMulti_5_1_0, 38)                                                         \
    X(bd::AudioChannelTypeMulti_5_1_1, 39)                                                         \
    X(bd::AudioChannelTypeMulti_5_2_0, 40)                                                         \
    X(bd::AudioChannelTypeMulti_5_2_1, 41)                                                         \
    X(bd::AudioChannelTypeMulti_5_3_0, 42)                                                         \
    X(bd::AudioChannelTypeOthers, 43)

#define USER_OPERATIONS(X)                                                                         \
    X(bd::UserOperationChapterSearch, 2)                                                           \
    X(bd::UserOperationTimeSearch, 3)                                                              \
    X(bd::UserOperationSkipToNextPoint, 4)                                                         \
    X(bd::UserOperationSkipBackToPreviousPoint, 5)                                                 \
    X(bd::UserOperationStop, 7)                                                                    \
    X(bd::UserOperationPauseOn, 8)                                                                 \
    X(bd::UserOperationStillOff, 10)                                                               \
    X(bd::UserOperationForwardPlay, 11)                                                            \
    X(bd::UserOperationBackwardPlay, 12)                                                           \
    X(bd::UserOperationResume, 13)                                                                 \
    X(bd::UserOperationMoveUpSelectedButton, 14)                                                   \
    X(bd::UserOperationMoveDownSelectedButton, 15)                                                 \
    X(bd::UserOperationMoveLeftSelectedButton, 16)                                                 \
    X(bd::UserOperationMoveRightSelectedButton, 17)                                                \
    X(bd::UserOperationSelectButton, 18)                                                           \
    X(bd::UserOperationActivateButton, 19)                                                         \
    X(bd::UserOperationSelectButtonAndActivate, 20)                                                \
    X(bd::UserOperationPrimaryAudioStreamNumberChange, 21)                                         \
    X(bd::UserOperationAngleNumberChange, 23)                                                      \
    X(bd::UserOperationPopupOn, 24)                                                                \
    X(bd::UserOperationPopupOff, 25)                                                               \
    X(bd::UserOperationPGTextSTEnableDisable, 26)                                                  \
    X(bd::UserOperationPGTextSTStreamNumberChange, 27)                                             \
    X(bd::UserOperationSecondaryVideoEnableDisable, 28)                                            \
    X(bd::UserOperationSecondaryVideoStreamNumberChange, 29)                                       \
    X(bd::UserOperationSecondaryAudioEnableDisable, 30)                                            \
    X(bd::UserOperationSecondaryAudioStreamNumberChange, 31)                                       \
    X(bd::UserOperationPiPPGTextSTStreamNumberChange, 33)

#define SECONDARY_VIDEO_SIZES(X)                                                                   \
    X(bd::SecondaryVideoSizeFromMetadata, 0)                                                       \
    X(bd::SecondaryVideoSizeFullScreen, 15)

#define SUB_PATH_TYPES(X)                                                                          \
    X(bd::SubPathAudioPresentationPath, 2)                                                         \
    X(bd::SubPathIGPresentationMenu, 3)                                                            \
    X(bd::SubPathTSPresentationPath, 4)                                                            \
    X(bd::SubPathOutOfMuxSynchPipPresentationPath, 5)                                              \
    X(bd::SubPathOutOfMuxASynchPipPresentationPath, 6)                                             \
    X(bd::SubPathInMuxSynchPipPresentationPath, 7)                                                 \
    X(bd::SubPathTypeUndefined, 255)

#define STILL_MODES(X)                                                                             \
    X(bd::StillModeNotStill, 0)                                                                    \
    X(bd::StillModeForFiniteDuration, 1)                                                           \
    X(bd::StillModeForInfiniteDuration, 2)

#define COMPONENTS(X)                                                                              \
    X(bd::CompIdBdavArchiver, 32)                                                                  \
    X(bd::CompIdBdavDiscManager, 33)                                                               \
    X(bd::CompIdBdavEditor, 34)                                                                    \
    X(bd::CompIdBdavInformation, 35)                                                               \
    X(bd::CompIdBdavNavigator, 36)                                                                 \
    X(bd::CompIdBdavReplicator, 37)                                                                \
    X(bd::CompIdBdavSystem, 38)                                                                    \
    X(bd::CompIdBdavFactory, 39)                                                                   \
    X(bd::CompIdBdavDatabase, 40)                                                                  \
    X(bd::CompIdCommon, 41)                                                                        \
    X(bd::CompIdFileManager, 43)                                                                   \
    X(bd::CompIdImageProcessor, 44)                                                                \
    X(bd::CompIdScheduler, 45)                                                                     \
    X(bd::CompIdStreamer, 46)                                                                      \
    X(bd::CompIdDecoder, 47)                                                                       \
    X(bd::CompIdStreamGateway, 48)                                                                 \
    X(bd::CompIdStreamParser, 49)                                                                  \
    X(bd::CompIdIgDecoder, 50)                                                                     \
    X(bd::CompIdPgDecoder, 51)                                                                     \
    X(bd::CompIdTsDecoder, 52)                                                                     \
    X(bd::CompIdReader, 53)                                                                        \
    X(bd::CompIdTest, 54)                                                                          \
    X(bd::CompIdBdmvDiscManager, 55)                                                               \
    X(bd::CompIdBdmvInformation, 56)                                                               \
    X(bd::CompIdBdmvNavigator, 57)                                                                 \
    X(bd::CompIdBdmvSystem, 58)                                                                    \
    X(bd::CompIdBdmvFactory, 59)                                                                   \
    X(bd::CompIdBdmvDatabase, 60)                                                                  \
    X(bd::CompIdBdmvUserEventManager, 61)                                                          \
    X(bd::CompIdBdmvHdmv, 62)                                                                      \
    X(bd::CompIdBdmvCommandProcessor, 63)                                                          \
    X(bd::CompIdBdmvModuleManager, 64)                                                             \
    X(bd::CompIdBdmvCache, 65)                                                                     \
    X(bd::CompIdBdmvJavaModule, 66)                                                                \
    X(bd::CompIdJpiConnector, 67)                                                                  \
    X(bd::CompIdJbiConnector, 68)                                                                  \
    X(bd::CompIdBdioSystem, 69)                                                                    \
    X(bd::CompIdBdioDiscRecognition, 70)                                                           \
    X(bd::CompIdBdioVfs, 71)                                                                       \
    X(bd::CompIdBdSystem, 72)                                                                      \
    X(bd::CompIdBdj, 73)                                                                           \
    X(bd::CompIdBdmvBdjAdapter, 74)                                                                \
    X(bd::CompIdJpi, 75)                                                                           \
    X(bd::CompIdJbiGraphics, 77)                                                                   \
    X(bd::CompIdJbiIo, 78)                                                                         \
    X(bd::CompIdJbiMedia, 79)                                                                      \
    X(bd::CompIdJbiMisc, 80)                                                                       \
    X(bd::CompIdJbiOsa, 81)                                                                        \
    X(bd::CompIdJbiTi, 82)                                                                         \
    X(bd::CompId__sizeof, 83)

#define LOG_LEVELS(X)                                                                              \
    X(bd::LogMethod, 0)                                                                            \
    X(bd::LogInterface, 1)                                                                         \
    X(bd::LogException, 2)                                                                         \
    X(bd::LogWarning, 3)                                                                           \
    X(bd::LogState, 4)                                                                             \
    X(bd::LogEvent, 5)                                                                             \
    X(bd::LogInfo, 6)                                                                              \
    X(bd::LogFree1, 7)                                                                             \
    X(bd::LogFree2, 8)                                                                             \
    X(bd::LogFree3, 9)                                                                             \
    X(bd::LogFree4, 10)                                                                            \
    X(bd::LogDefault, 11)                                                                          \
    X(bd::LogRuntime, 12)                                                                          \
    X(bd::LogFatal, 13)                                                                            \
    X(bd::LogLevel__sizeof, 14)                                                                    \
    X(bd::LogHighFrequency, 16)

#define PLATFORM_LOG_LEVELS(X)                                                                     \
    X(KEVRO_Log_LevelMethod, 0)                                                                    \
    X(KEVRO_Log_LevelInterface, 1)                                                                 \
    X(KEVRO_Log_LevelException, 2)                                                                 \
    X(KEVRO_Log_LevelWarning, 3)                                                                   \
    X(KEVRO_Log_LevelState, 4)                                                                     \
    X(KEVRO_Log_LevelEvent, 5)                                                                     \
    X(KEVRO_Log_LevelInfo, 6)                                                                      \
    X(KEVRO_Log_LevelFree1, 7)                                                                     \
    X(KEVRO_Log_LevelFree2, 8)                                                                     \
    X(KEVRO_Log_LevelFree3, 9)                                                                     \
    X(KEVRO_Log_LevelFree4, 10)                                                                    \
    X(KEVRO_Log_LevelDefault, 11)                                                                  \
    X(KEVRO_Log_LevelRuntime, 12)                                                                  \
    X(KEVRO_Log_LevelFatal, 13)                                                                    \
    X(KEVRO_Log_Level__sizeof, 14)

#define COMMANDS(X)                                                                                \
    X(bdmv::INavigationCommandData::CommandNop, 0x00000000)                                        \
    X(bdmv::INavigationCommandData::CommandGoTo, 0x20010000)                                       \
    X(bdmv::INavigationCommandData::CommandBreak, 0x00020000)                                      \
    X(bdmv::INavigationCommandData::CommandJumpObject, 0x21000000)                                 \
    X(bdmv::INavigationCommandData::CommandJumpTitle, 0x21010000)                                  \
    X(bdmv::INavigationCommandData::CommandCallObject, 0x21020000)                                 \
    X(bdmv::INavigationCommandData::CommandCallTitle, 0x21030000)                                  \
    X(bdmv::INavigationCommandData::CommandResume, 0x01040000)                                     \
    X(bdmv::INavigationCommandData::CommandPlayPL, 0x22000000)                                     \
    X(bdmv::INavigationCommandData::CommandPlayPLEx, 0x22000001)                                   \
    X(bdmv::INavigationCommandData::CommandPlayPLatPI, 0x42010000)                                 \
    X(bdmv::INavigationCommandData::CommandPlayPLatMK, 0x42020000)                                 \
    X(bdmv::INavigationCommandData::CommandTerminatePL, 0x02030000)                                \
    X(bdmv::INavigationCommandData::CommandLinkPI, 0x22040000)                                     \
    X(bdmv::INavigationCommandData::CommandLinkMK, 0x22050000)                                     \
    X(bdmv::INavigationCommandData::CommandBC, 0x48000100)                                         \
    X(bdmv::INavigationCommandData::CommandEQ, 0x48000200)                                         \
    X(bdmv::INavigationCommandData::CommandNE, 0x48000300)                                         \
    X(bdmv::INavigationCommandData::CommandGE, 0x48000400)                                         \
    X(bdmv::INavigationCommandData::CommandGT, 0x48000500)                                         \
    X(bdmv::INavigationCommandData::CommandLE, 0x48000600)                                         \
    X(bdmv::INavigationCommandData::CommandLT, 0x48000700)                                         \
    X(bdmv::INavigationCommandData::CommandMove, 0x50000001)                                       \
    X(bdmv::INavigationCommandData::CommandSwap, 0x50000002)                                       \
    X(bdmv::INavigationCommandData::CommandAdd, 0x50000003)                                        \
    X(bdmv::INavigationCommandData::CommandSub, 0x50000004)                                        \
    X(bdmv::INavigationCommandData::CommandMul, 0x50000005)                                        \
    X(bdmv::INavigationCommandData::CommandDiv, 0x50000006)                                        \
    X(bdmv::INavigationCommandData::CommandMod, 0x50000007)                                        \
    X(bdmv::INavigationCommandData::CommandRnd, 0x50000008)                                        \
    X(bdmv::INavigationCommandData::CommandAnd, 0x50000009)                                        \
    X(bdmv::INavigationCommandData::CommandOr, 0x5000000a)                                         \
    X(bdmv::INavigationCommandData::CommandXor, 0x5000000b)                                        \
    X(bdmv::INavigationCommandData::CommandBitSet, 0x5000000c)                                     \
    X(bdmv::INavigationCommandData::CommandBitClear, 0x5000000d)                                   \
    X(bdmv::INavigationCommandData::CommandShiftLeft, 0x5000000e)                                  \
    X(bdmv::INavigationCommandData::CommandShiftRight, 0x5000000f)                                 \
    X(bdmv::INavigationCommandData::CommandSetStream, 0x51000001)                                  \
    X(bdmv::INavigationCommandData::CommandSetNVTimer, 0x51000002)                                 \
    X(bdmv::INavigationCommandData::CommandSetButtonPage, 0x51000003)                              \
    X(bdmv::INavigationCommandData::CommandEnableButton, 0x31000004)                               \
    X(bdmv::INavigationCommandData::CommandDisableButton, 0x31000005)                              \
    X(bdmv::INavigationCommandData::CommandSetSecondaryStream, 0x51000006)                         \
    X(bdmv::INavigationCommandData::CommandPopupMenuOff, 0x11000007)                               \
    X(bdmv::INavigationCommandData::CommandStillOn, 0x11000008)                                    \
    X(bdmv::INavigationCommandData::CommandStillOff, 0x11000009)

#define STREAMING_FINISHED_REASONS(X)                                                              \
    X(bdstreaming::FinishedReasonEndOfMedia, 0)                                                    \
    X(bdstreaming::FinishedReasonDataStarvation, 1)

#define LISTENER_FINISHED_REASONS(X)                                                               \
    X(bdmv::INavControlListener::EndOfMedia, 0)                                                    \
    X(bdmv::INavControlListener::DataStarvation, 1)

#define MARK_TYPES(X)                                                                              \
    X(bdmv::IPlayListMark::MarkTypeEntryMark, 1)                                                   \
    X(bdmv::IPlayListMark::MarkTypeLinkPoint, 2)

#define ERROR_CODES(X)                                                                             \
    X(bdmv::INavError::ErrOk, 0)                                                                   \
    X(bdmv::INavError::ErrOkRace, 1)                                                               \
    X(bdmv::INavError::ErrFailed, 2)                                                               \
    X(bdmv::INavError::ErrInvalidParam, 3)                                                         \
    X(bdmv::INavError::ErrInvalidState, 4)                                                         \
    X(bdmv::INavError::ErrIgFailed, 5)                                                             \
    X(bdmv::INavError::ErrOkIgnored, 6)                                                            \
    X(bdmv::INavError::ErrNotAllowed, 7)

#define SUB_COMPONENTS(X) X(bd::SubCompId__sizeof, 0)

TEST_ENUMERATION(PlayDirectionDef, bd::PlayDirectionDef, PLAY_DIRECTIONS)
TEST_ENUMERATION(PlaySpeedDef, bd::PlaySpeedDef, PLAY_SPEEDS)
TEST_ENUMERATION(TriggerType, bd::TriggerType, TRIGGER_TYPES)
TEST_ENUMERATION(VideoFormatType, bd::VideoFormatType, VIDEO_FORMATS)
TEST_ENUMERATION(VideoAspectRatioType, bd::VideoAspectRatioType, VIDEO_ASPECT_RATIOS)
TEST_ENUMERATION(AudioFormatType, bd::AudioFormatType, AUDIO_FORMATS)
TEST_ENUMERATION(AudioSampleRateType, bd::AudioSampleRateType, AUDIO_SAMPLE_RATES)
TEST_ENUMERATION(AudioBitsPerSamplingType, bd::AudioBitsPerSamplingType, AUDIO_BITS_PER_SAMPLING)
TEST_ENUMERATION(AudioChannelType, bd::AudioChannelType, AUDIO_CHANNELS)
TEST_ENUMERATION(UserOperationMaskDef, bd::UserOperationMaskDef, USER_OPERATIONS)
TEST_ENUMERATION(SecondaryVideoSize, bd::SecondaryVideoSize, SECONDARY_VIDEO_SIZES)
TEST_ENUMERATION(SubPathType, bd::SubPathType, SUB_PATH_TYPES)
TEST_ENUMERATION(StillModeDef, bd::StillModeDef, STILL_MODES)
TEST_ENUMERATION(CompIdDef, bd::CompIdDef, COMPONENTS)
TEST_ENUMERATION(SubCompIdDef, bd::SubCompIdDef, SUB_COMPONENTS)
TEST_ENUMERATION(LogLevelDef, bd::LogLevelDef, LOG_LEVELS)
TEST_ENUMERATION(PlatformLogLevel, KEVRO_Log_Level, PLATFORM_LOG_LEVELS)
TEST_ENUMERATION(StreamingFinishedReason, bdstreaming::FinishedReason, STREAMING_FINISHED_REASONS)
TEST_ENUMERATION(ListenerFinishedReason, bdmv::INavControlListener::FinishedReason,
                 LISTENER_FINISHED_REASONS)
TEST_ENUMERATION(MarkType, bdmv::IPlayListMark::MarkType, MARK_TYPES)
TEST_ENUMERATION(ErrCode, bdmv::INavError::ErrCode, ERROR_CODES)
TEST_ENUMERATION(Command, bdmv::INavigationCommandData::Command, COMMANDS)

template <typename Enumeration> class FixedWidthEnumerations : public testing::Test
{
};

typedef testing::Types<bd::PlayDirectionDef, bd::PlaySpeedDef, bd::TriggerType, bd::VideoFormatType,
                       bd::VideoAspectRatioType, bd::AudioFormatType, bd::AudioSampleRateType,
                       bd::AudioBitsPerSamplingType, bd::AudioChannelType, bd::UserOperationMaskDef,
                       bd::SecondaryVideoSize, bd::SubPathType, bd::StillModeDef, bd::CompIdDef,
                       bd::SubCompIdDef, bd::LogLevelDef, bdstreaming::FinishedReason,
                       bdmv::INavControlListener::FinishedReason, bdmv::IPlayListMark::MarkType,
                       bdmv::INavError::ErrCode>
    SignedEnumerations;
TYPED_TEST_SUITE(FixedWidthEnumerations, SignedEnumerations, );

TYPED_TEST(FixedWidthEnumerations, HasASigned32BitUnderlyingType)
{
    EXPECT_TRUE((std::is_same_v<std::underlying_type_t<TypeParam>, KEVRO_Int32>));
}

TYPED_TEST(FixedWidthEnumerations, IsUnscoped)
{
    EXPECT_TRUE((std::is_convertible_v<TypeParam, int>));
}

TYPED_TEST(FixedWidthEnumerations, CarriesAValueOutsideTheList)
{
    EXPECT_EQ(-12345, static_cast<KEVRO_Int32>(static_cast<TypeParam>(-12345)));
}

TEST(Enumerations, CommandHasAnUnsigned32BitUnderlyingType)
{
    EXPECT_TRUE((std::is_same_v<std::underlying_type_t<bdmv::INavigationCommandData::Command>,
                                KEVRO_UInt32>));
}

TEST(Enumerations, CommandIsUnscoped)
{
    EXPECT_TRUE((std::is_convertible_v<bdmv::INavigationCommandData::Command, unsigned>));
}

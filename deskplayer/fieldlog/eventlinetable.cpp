#include "fieldlog/eventlines.h"

namespace deskplayer
{

namespace
{

/** @param arguments by conversion: the position of the argument in the callback, or NoArgument */
template <typename... Position>
constexpr EventLine Line(std::string_view format, LineRole role, bdmv::CallbackId callback,
                         Position... arguments)
{
    EventLine line = {format,
                      format.substr(0, format.find('%')),
                      role,
                      callback,
                      {NoArgument, NoArgument, NoArgument, NoArgument},
                      std::nullopt};
    std::size_t conversion = 0;
    ((line.arguments[conversion++] = static_cast<std::int8_t>(arguments)), ...);
    return line;
}

/** A line after the first one of an event with several callbacks. @param first of its callbacks */
constexpr EventLine Continuing(bdmv::CallbackId first, EventLine line)
{
    line.continues = first;
    return line;
}

/** Sorted by byte values. */
constexpr EventLine Lines[] = {
    Continuing(bdmv::CallbackPlayMode,
               Line("For normal play notify async 2ndaud available", LineRole::Announces,
                    bdmv::CallbackSecondaryAudioAvailable)),
    Continuing(bdmv::CallbackPlayMode,
               Line("For normal play notify async pip available", LineRole::Announces,
                    bdmv::CallbackPictureInPictureAvailable)),
    Continuing(bdmv::CallbackPlayMode,
               Line("For speed play notify async 2ndaud unavailable", LineRole::Announces,
                    bdmv::CallbackSecondaryAudioUnavailable)),
    Continuing(bdmv::CallbackPlayMode,
               Line("For speed play notify async pip unavailable", LineRole::Announces,
                    bdmv::CallbackPictureInPictureUnavailable)),
    Line("Not send unavailable for async 2nd audio", LineRole::Revokes,
         bdmv::CallbackSecondaryAudioUnavailable),
    Line("Not send unavailable for async 2nd video", LineRole::Revokes,
         bdmv::CallbackPictureInPictureUnavailable),
    Continuing(bdmv::CallbackPlayItem,
               Line("Send available for async 2nd audio", LineRole::Announces,
                    bdmv::CallbackSecondaryAudioAvailable)),
    Continuing(bdmv::CallbackPlayItem,
               Line("Send available for async 2nd video", LineRole::Announces,
                    bdmv::CallbackPictureInPictureAvailable)),
    Continuing(bdmv::CallbackPlayItem, Line("Send unavailable for 2nd audio", LineRole::Announces,
                                            bdmv::CallbackSecondaryAudioUnavailable)),
    Continuing(bdmv::CallbackPlayItem, Line("Send unavailable for 2nd video", LineRole::Announces,
                                            bdmv::CallbackPictureInPictureUnavailable)),
    Continuing(bdmv::CallbackSecondaryAudioInfo,
               Line("Sending ((SecondaryAudioDisplay)) - audioNr %d, numOfAudios %d, shown: %s",
                    LineRole::Announces, bdmv::CallbackSecondaryAudioDisplay, 0, NoArgument, 1)),
    Continuing(
        bdmv::CallbackSecondaryVideoInfo,
        Line("Sending ((SecondaryVideoDisplay)) - video Nr %d, numofVideos %d, async %d, shown: %s",
             LineRole::Announces, bdmv::CallbackSecondaryVideoDisplay, 0, NoArgument, NoArgument,
             1)),
    Line("Sending AngleInfo - angleNr: %u", LineRole::Announces, bdmv::CallbackAngleInfo, 0),
    Line("Sending AudioChannelsChanged", LineRole::Announces, bdmv::CallbackAudioInfoChanged),
    Line("Sending AudioInfo - audioNr: %u", LineRole::Announces, bdmv::CallbackAudioInfo, 0),
    Line("Sending ButtonActivationBusy", LineRole::Announces, bdmv::CallbackButtonActivationBusy),
    Line("Sending ButtonActivationDone", LineRole::Announces, bdmv::CallbackButtonActivationDone),
    Line("Sending Chapter - chapterNumber: %u", LineRole::Announces, bdmv::CallbackChapterNumber,
         0),
    Line("Sending Continued with playmode: dir %d, speed %d (currentplaymode: dir %d, speed %d)",
         LineRole::Announces, bdmv::CallbackContinued, 0, 1, NoArgument, NoArgument),
    Line("Sending CurrentTimePosition - position: %llu", LineRole::Announces,
         bdmv::CallbackCurrentTimePosition, 0),
    Line("Sending ExecuteButton - ticket: %lu, buttonId: %u", LineRole::Announces,
         bdmv::CallbackExecuteButton, 0, 1),
    Line("Sending Finished - reason: %d", LineRole::Announces, bdmv::CallbackFinished, 0),
    Line("Sending FirstPictureDeliveredEvent", LineRole::Announces,
         bdmv::CallbackFirstPictureDelivered),
    Line("Sending InteractiveGraphicsActive", LineRole::Announces,
         bdmv::CallbackInteractiveGraphicsActive),
    Line("Sending InteractiveGraphicsInactive", LineRole::Announces,
         bdmv::CallbackInteractiveGraphicsInactive),
    Line("Sending InteractiveGraphicsInfo - igNr: %u", LineRole::Announces,
         bdmv::CallbackInteractiveGraphicsInfo, 0),
    Line("Sending InteractiveGraphicsInvisible", LineRole::Announces,
         bdmv::CallbackInteractiveGraphicsInvisible),
    Line("Sending InteractiveGraphicsVisible", LineRole::Announces,
         bdmv::CallbackInteractiveGraphicsVisible),
    Line("Sending JumpOccurred", LineRole::Announces, bdmv::CallbackJumpOccurred),
    Line("Sending MarkInfo - markId: %u, time: %llu", LineRole::Announces, bdmv::CallbackMarkInfo,
         1, 2),
    Line("Sending Paused", LineRole::Announces, bdmv::CallbackPaused),
    Line("Sending PictureInPictureAvailable", LineRole::Announces,
         bdmv::CallbackPictureInPictureAvailable),
    Line("Sending PictureInPictureUnavailable", LineRole::AnnouncesRevocably,
         bdmv::CallbackPictureInPictureUnavailable),
    Line("Sending PipPgTextSelectEvent - pip pick?: %s", LineRole::Announces,
         bdmv::CallbackPipPgTextSelect, 0),
    Line("Sending PipPgTextStInfo - pgTextStNr: %u, avaliable %d", LineRole::Announces,
         bdmv::CallbackPipPgTextStInfo, 0, 1),
    Line("Sending PlayFailed", LineRole::Announces, bdmv::CallbackPlayFailed),
    Line("Sending PlayItem - playListId: %lu, playItemId: %u, videoFormat %d, aspectRatio %d",
         LineRole::Announces, bdmv::CallbackPlayItem, 0, 1, 2, 3),
    Line("Sending PlayMode - direction: %u, speedIndex: %u", LineRole::Announces,
         bdmv::CallbackPlayMode, 0, 1),
    Line("Sending PlayStarted", LineRole::Announces, bdmv::CallbackPlayStarted),
    Line("Sending Playlist - playListId: %lu", LineRole::Announces, bdmv::CallbackPlaylist, 0),
    Line("Sending PopUpMenuAvailable", LineRole::Announces, bdmv::CallbackPopUpMenuAvailable),
    Line("Sending PopUpMenuUnavailable", LineRole::Announces, bdmv::CallbackPopUpMenuUnavailable),
    Line("Sending PreloadFailed", LineRole::Announces, bdmv::CallbackPreloadFailed),
    Line("Sending PresentationGraphicsDisplay - shown: %s", LineRole::Announces,
         bdmv::CallbackPresentationGraphicsDisplay, 0),
    Line("Sending PresentationGraphicsInfo - pgTextStNr: %u, available: %s", LineRole::Announces,
         bdmv::CallbackPresentationGraphicsInfo, 0, 1),
    Line("Sending ResumeFailed", LineRole::Announces, bdmv::CallbackResumeFailed),
    Line("Sending Resumed", LineRole::Announces, bdmv::CallbackResumed),
    Line("Sending SecondaryAudioAvailable", LineRole::Announces,
         bdmv::CallbackSecondaryAudioAvailable),
    Line("Sending SecondaryAudioDisplay - audioNr %d, numOfAudios %d, shown: %s",
         LineRole::Announces, bdmv::CallbackSecondaryAudioDisplay, 0, NoArgument, 1),
    Line("Sending SecondaryAudioInfo - audioNr: %u", LineRole::Announces,
         bdmv::CallbackSecondaryAudioInfo, 0),
    Line("Sending SecondaryAudioUnavailable", LineRole::AnnouncesRevocably,
         bdmv::CallbackSecondaryAudioUnavailable),
    Line("Sending SecondaryVideoDisplay - video Nr %d, numofVideos %d, async %d, shown: %s",
         LineRole::Announces, bdmv::CallbackSecondaryVideoDisplay, 0, NoArgument, NoArgument, 1),
    Line("Sending SecondaryVideoInfo - videoNr: %u", LineRole::Announces,
         bdmv::CallbackSecondaryVideoInfo, 0),
    Line("Sending Stepped - position: %llu,dir=%d", LineRole::Announces, bdmv::CallbackStepped, 0,
         1),
    Line("Sending StillOff", LineRole::Announces, bdmv::CallbackStillOff),
    Line("Sending StillOn", LineRole::Announces, bdmv::CallbackStillOn),
    Line("Sending Stopped", LineRole::Announces, bdmv::CallbackStopped),
    Line("Sending Suspended", LineRole::Announces, bdmv::CallbackSuspended),
    Line("Sending SystemResumeFailed", LineRole::Announces, bdmv::CallbackSystemResumeFailed),
    Line("Sending SystemResumed - playing: %s", LineRole::Announces, bdmv::CallbackSystemResumed,
         0),
    Line("Sending SystemSuspended - dataSize: %lu", LineRole::Announces,
         bdmv::CallbackSystemSuspended, 1),
    Line("Sending TextSubtitleStyleInfo - styleNumber: %u", LineRole::Announces,
         bdmv::CallbackTextSubtitleStyleInfo, 0),
    Line("Sending TextSubtitleStylesAvailable - numberOfStyles: %u", LineRole::Announces,
         bdmv::CallbackTextSubtitleStylesAvailable, 0),
    Line("Sending Trigger Reached", LineRole::AnnouncesInPart, bdmv::CallbackTriggerTimeReached),
    Line("Sending Trigger Set", LineRole::Announces, bdmv::CallbackTriggerSet),
    Line("Sending UOMask - uoMask: %llu", LineRole::Announces, bdmv::CallbackUOMask, 0),
    Line("Sending VideoInfo - videoNr: %u", LineRole::Announces, bdmv::CallbackVideoInfo, 0),
    Line("Sending ZoomModeSetEvent callback", LineRole::Announces, bdmv::CallbackZoomModeSet),
    Line("TriggerRead time type=%d,time = %llu", LineRole::Completes,
         bdmv::CallbackTriggerTimeReached, 0, 1),
};

} // namespace

EventLines AllEventLines()
{
    return {std::begin(Lines), std::end(Lines)};
}

} // namespace deskplayer

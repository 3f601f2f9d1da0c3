#include "eventtest.h"

namespace
{

typedef Context::Stream Stream;

void ShowsNothing(Context&) {}

void ShowsSubtitles(Context& context)
{
    context.pgTextStDisplay = true;
}

void PicksPipSubtitles(Context& context)
{
    context.pipPgTextStSelect = true;
}

void ShowsSecondaryStreams(Context& context)
{
    context.secondaryVideo = Stream{65535, 255};
    context.secondaryVideoAsync = true;
    context.secondaryVideoDisplay = true;
    context.secondaryAudio = Stream{65535, 255};
    context.secondaryAudioDisplay = true;
}

void HidesSecondaryStreams(Context& context)
{
    context.secondaryVideo = Stream{2, 3};
    context.secondaryAudio = Stream{4, 5};
}

void LeavesSecondaryStreams(Context& context)
{
    ShowsSecondaryStreams(context);
    context.untouched = {"GetSecondaryVideoInfo", "GetSecondaryAudioInfo"};
}

const Scenario displayScenarios[] = {
    {"SubtitlesShown", New<bdmv::PresentationGraphicsDisplayEvent>(), ShowsSubtitles,
     Queried("GetPgTextStDisplay() -> true") +
         Logged("Sending PresentationGraphicsDisplay - shown: TRUE") +
         Fired("PresentationGraphicsDisplay(true)")},
    {"SubtitlesHidden", New<bdmv::PresentationGraphicsDisplayEvent>(), ShowsNothing,
     Queried("GetPgTextStDisplay() -> false") +
         Logged("Sending PresentationGraphicsDisplay - shown: FALSE") +
         Fired("PresentationGraphicsDisplay(false)")},

    {"PipSubtitlesPicked", New<bdmv::PipPgTextSelectEvent>(), PicksPipSubtitles,
     Queried("GetPipPgTextStSelect() -> true") +
         Logged("Sending PipPgTextSelectEvent - pip pick?: TRUE") + Fired("PipPgTextSelect(true)")},
    {"PipSubtitlesNotPicked", New<bdmv::PipPgTextSelectEvent>(), ShowsSubtitles,
     Queried("GetPipPgTextStSelect() -> false") +
         Logged("Sending PipPgTextSelectEvent - pip pick?: FALSE") +
         Fired("PipPgTextSelect(false)")},

    {"SecondaryVideoShown", New<bdmv::SecondaryVideoDisplayEvent>(), ShowsSecondaryStreams,
     Queried("GetSecondaryVideoDisplay() -> true") +
         Queried("GetSecondaryVideoInfo(0, 0, false) -> 65535, 255, true") +
         Logged("Sending SecondaryVideoDisplay - video Nr 65535, numofVideos 255, async 1, shown: "
                "TRUE") +
         Fired("SecondaryVideoDisplay(65535, true)")},
    {"SecondaryVideoHidden", New<bdmv::SecondaryVideoDisplayEvent>(), HidesSecondaryStreams,
     Queried("GetSecondaryVideoDisplay() -> false") +
         Queried("GetSecondaryVideoInfo(0, 0, false) -> 2, 3, false") +
         Logged("Sending SecondaryVideoDisplay - video Nr 2, numofVideos 3, async 0, shown: "
                "FALSE") +
         Fired("SecondaryVideoDisplay(2, false)")},
    {"SecondaryVideoUntouched", New<bdmv::SecondaryVideoDisplayEvent>(), LeavesSecondaryStreams,
     Queried("GetSecondaryVideoDisplay() -> true") +
         Queried("GetSecondaryVideoInfo(0, 0, false) -> untouched") +
         Logged("Sending SecondaryVideoDisplay - video Nr 0, numofVideos 0, async 0, shown: "
                "TRUE") +
         Fired("SecondaryVideoDisplay(0, true)")},

    {"SecondaryAudioShown", New<bdmv::SecondaryAudioDisplayEvent>(), ShowsSecondaryStreams,
     Queried("GetSecondaryAudioDisplay() -> true") +
         Queried("GetSecondaryAudioInfo(0, 0) -> 65535, 255") +
         Logged("Sending SecondaryAudioDisplay - audioNr 65535, numOfAudios 255, shown: TRUE") +
         Fired("SecondaryAudioDisplay(65535, true)")},
    {"SecondaryAudioHidden", New<bdmv::SecondaryAudioDisplayEvent>(), HidesSecondaryStreams,
     Queried("GetSecondaryAudioDisplay() -> false") +
         Queried("GetSecondaryAudioInfo(0, 0) -> 4, 5") +
         Logged("Sending SecondaryAudioDisplay - audioNr 4, numOfAudios 5, shown: FALSE") +
         Fired("SecondaryAudioDisplay(4, false)")},
    {"SecondaryAudioUntouched", New<bdmv::SecondaryAudioDisplayEvent>(), LeavesSecondaryStreams,
     Queried("GetSecondaryAudioDisplay() -> true") +
         Queried("GetSecondaryAudioInfo(0, 0) -> untouched") +
         Logged("Sending SecondaryAudioDisplay - audioNr 0, numOfAudios 0, shown: TRUE") +
         Fired("SecondaryAudioDisplay(0, true)")},
};

INSTANTIATE_TEST_SUITE_P(Display, EventScenario, testing::ValuesIn(displayScenarios),
                         EventScenario::Name);

void HasNoAsyncStream(Context& context)
{
    context.prev2ndVid = context.prev2ndAud = true;
}

void HasAsyncVideo(Context& context)
{
    context.async2ndVid = true;
}

void HasAsyncAudio(Context& context)
{
    context.async2ndAud = true;
}

void HasEverything(Context& context)
{
    context.async2ndVid = context.async2ndAud = context.prev2ndVid = context.prev2ndAud = true;
}

void LeavesAsyncFlags(Context& context)
{
    HasEverything(context);
    context.untouched = {"IsAsyncPipInCurrentPlayItem"};
}

std::string AsyncFlags(const std::string& flags)
{
    return Queried("IsAsyncPipInCurrentPlayItem(false, false, false, false) -> " + flags);
}

const std::string pipLine = Logged("Sending PictureInPictureUnavailable");
const std::string audioLine = Logged("Sending SecondaryAudioUnavailable");

const Scenario availabilityScenarios[] = {
    {"PipAvailable", New<bdmv::PipAvailableEvent>(), HasNoAsyncStream,
     Logged("Sending PictureInPictureAvailable") + Fired("PictureInPictureAvailable()")},
    {"SecondaryAudioAvailable", New<bdmv::SecondaryAudioAvailableEvent>(), HasNoAsyncStream,
     Logged("Sending SecondaryAudioAvailable") + Fired("SecondaryAudioAvailable()")},

    {"PipUnavailable", New<bdmv::PipUnavailableEvent>(), HasNoAsyncStream,
     pipLine + AsyncFlags("false, false, true, true") + Fired("PictureInPictureUnavailable()")},
    {"PipUnavailableWithAsyncAudio", New<bdmv::PipUnavailableEvent>(), HasAsyncAudio,
     pipLine + AsyncFlags("false, true, false, false") + Fired("PictureInPictureUnavailable()")},
    {"PipUnavailableWithAsyncVideo", New<bdmv::PipUnavailableEvent>(), HasAsyncVideo,
     pipLine + AsyncFlags("true, false, false, false") +
         Logged("Not send unavailable for async 2nd video")},
    {"PipUnavailableWithEverything", New<bdmv::PipUnavailableEvent>(), HasEverything,
     pipLine + AsyncFlags("true, true, true, true") +
         Logged("Not send unavailable for async 2nd video")},
    {"PipUnavailableUntouched", New<bdmv::PipUnavailableEvent>(), LeavesAsyncFlags,
     pipLine + AsyncFlags("untouched") + Fired("PictureInPictureUnavailable()")},

    {"SecondaryAudioUnavailable", New<bdmv::SecondaryAudioUnavailableEvent>(), HasNoAsyncStream,
     audioLine + AsyncFlags("false, false, true, true") + Fired("SecondaryAudioUnavailable()")},
    {"SecondaryAudioUnavailableWithAsyncVideo", New<bdmv::SecondaryAudioUnavailableEvent>(),
     HasAsyncVideo,
     audioLine + AsyncFlags("true, false, false, false") + Fired("SecondaryAudioUnavailable()")},
    {"SecondaryAudioUnavailableWithAsyncAudio", New<bdmv::SecondaryAudioUnavailableEvent>(),
     HasAsyncAudio,
     audioLine + AsyncFlags("false, true, false, false") +
         Logged("Not send unavailable for async 2nd audio")},
    {"SecondaryAudioUnavailableWithEverything", New<bdmv::SecondaryAudioUnavailableEvent>(),
     HasEverything,
     audioLine + AsyncFlags("true, true, true, true") +
         Logged("Not send unavailable for async 2nd audio")},
    {"SecondaryAudioUnavailableUntouched", New<bdmv::SecondaryAudioUnavailableEvent>(),
     LeavesAsyncFlags, audioLine + AsyncFlags("untouched") + Fired("SecondaryAudioUnavailable()")},
};

INSTANTIATE_TEST_SUITE_P(Availability, EventScenario, testing::ValuesIn(availabilityScenarios),
                         EventScenario::Name);

class SuppressedEvents : public EventTest
{
protected:
    /** Makes A dispatch an event on the list while the list is locked for another event. */
    template <typename Event> std::string DispatchWhileTheListIsHeld()
    {
        a.onCallback = [this](const std::string&) {
            journal.Take();
            bdmv::INavigatorEvent* const event = new Event(context);
            event->Dispatch(listeners);
            delete event;
            m_Inner = journal.Take();
        };
        Dispatch<bdmv::PausedEvent>();
        return m_Inner;
    }

private:
    std::string m_Inner;
};

TEST_F(SuppressedEvents, PipUnavailableDoesNotTakeTheLock)
{
    HasAsyncVideo(context);

    EXPECT_EQ(DispatchWhileTheListIsHeld<bdmv::PipUnavailableEvent>(),
              pipLine + AsyncFlags("true, false, false, false") +
                  Logged("Not send unavailable for async 2nd video"));
}

TEST_F(SuppressedEvents, SecondaryAudioUnavailableDoesNotTakeTheLock)
{
    HasAsyncAudio(context);

    EXPECT_EQ(DispatchWhileTheListIsHeld<bdmv::SecondaryAudioUnavailableEvent>(),
              audioLine + AsyncFlags("false, true, false, false") +
                  Logged("Not send unavailable for async 2nd audio"));
}

TEST_F(SuppressedEvents, PresentationGraphicsInfoDoesNotTakeTheLock)
{
    context.rPgTextStResult = bdmv::INavError::ErrNotAllowed;

    EXPECT_EQ(DispatchWhileTheListIsHeld<bdmv::PresentationGraphicsInfoEvent>(),
              Queried("rGetPgTextStInfo(0, 0) -> 0, 0") +
                  Queried("rGetPgTextStInfo returned ErrNotAllowed"));
}

} // namespace

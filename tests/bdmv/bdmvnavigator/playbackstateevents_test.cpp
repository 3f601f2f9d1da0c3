#include "eventtest.h"

namespace
{

void PlaysBackwardWhileItIsSetForward(Context& context)
{
    context.playMode = bd::PlayMode(bd::PlayDirectionForward, bd::PlaySpeedSlow5);
    context.currentPlayMode = bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedFast12);
}

void SetsBackwardAtPosition(Context& context, bd::TimePosition position)
{
    context.currentTimePosition = position;
    context.playMode = bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedFast2);
}

std::function<void(Context&)> FinishesFor(int reason)
{
    return [reason](Context& context) {
        context.finishedReason = static_cast<bdstreaming::FinishedReason>(reason);
    };
}

const std::string assertion = "assert: false, bdmv/bdmvnavigator/navigatorevent.cpp:885\n";

const Scenario playbackStateScenarios[] = {
    Notification<bdmv::PlayStartedEvent>("Sending PlayStarted", "PlayStarted()"),
    Notification<bdmv::FirstPictureDeliveredEvent>("Sending FirstPictureDeliveredEvent",
                                                   "FirstPictureDelivered()"),
    Notification<bdmv::PlayFailedEvent>("Sending PlayFailed", "PlayFailed()"),
    Notification<bdmv::PausedEvent>("Sending Paused", "Paused()"),
    Notification<bdmv::StoppedEvent>("Sending Stopped", "Stopped()"),
    Notification<bdmv::StillOnEvent>("Sending StillOn", "StillOn()"),
    Notification<bdmv::StillOffEvent>("Sending StillOff", "StillOff()"),
    Notification<bdmv::SuspendedEvent>("Sending Suspended", "Suspended()"),
    Notification<bdmv::ResumedEvent>("Sending Resumed", "Resumed()"),
    Notification<bdmv::ResumeFailedEvent>("Sending ResumeFailed", "ResumeFailed()"),
    Notification<bdmv::JumpOccurredEvent>("Sending JumpOccurred", "JumpOccurred()"),
    Notification<bdmv::PreloadFailedEvent>("Sending PreloadFailed", "PreloadFailed()"),

    {"ContinuedBackward", New<bdmv::ContinuedEvent>(),
     [](Context& context) {
         context.playMode = bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedFast2);
     },
     Queried("GetCurrentPlayMode() -> (PlayDirectionForward, PlaySpeedNormal)") +
         Queried("GetPlayMode() -> (PlayDirectionBackward, PlaySpeedFast2)") +
         Logged("Sending Continued with playmode: dir 1, speed 7 (currentplaymode: dir 0, speed "
                "5)") +
         Fired("Continued(PlayDirectionBackward, PlaySpeedFast2)")},
    {"ContinuedForward", New<bdmv::ContinuedEvent>(), PlaysBackwardWhileItIsSetForward,
     Queried("GetCurrentPlayMode() -> (PlayDirectionBackward, PlaySpeedFast12)") +
         Queried("GetPlayMode() -> (PlayDirectionForward, PlaySpeedSlow5)") +
         Logged("Sending Continued with playmode: dir 0, speed 0 (currentplaymode: dir 1, speed "
                "17)") +
         Fired("Continued(PlayDirectionForward, PlaySpeedSlow5)")},

    {"SteppedBackward", New<bdmv::SteppedEvent>(),
     [](Context& context) { SetsBackwardAtPosition(context, 900000); },
     Queried("GetCurrentTimePosition() -> 900000") +
         Queried("GetPlayMode() -> (PlayDirectionBackward, PlaySpeedFast2)") +
         Logged("Sending Stepped - position: 900000,dir=1") +
         Fired("Stepped(900000, PlayDirectionBackward)")},
    {"SteppedBeyond32Bits", New<bdmv::SteppedEvent>(),
     [](Context& context) { SetsBackwardAtPosition(context, 0xFFFFFFFFFFFFFFFEULL); },
     Queried("GetCurrentTimePosition() -> 18446744073709551614") +
         Queried("GetPlayMode() -> (PlayDirectionBackward, PlaySpeedFast2)") +
         Logged("Sending Stepped - position: 18446744073709551614,dir=1") +
         Fired("Stepped(18446744073709551614, PlayDirectionBackward)")},
    {"SteppedForwardWhilePlayingBackward", New<bdmv::SteppedEvent>(),
     PlaysBackwardWhileItIsSetForward,
     Queried("GetCurrentTimePosition() -> 0") +
         Queried("GetPlayMode() -> (PlayDirectionForward, PlaySpeedSlow5)") +
         Logged("Sending Stepped - position: 0,dir=0") + Fired("Stepped(0, PlayDirectionForward)")},

    {"FinishedAtTheEnd", New<bdmv::FinishedEvent>(),
     FinishesFor(bdstreaming::FinishedReasonEndOfMedia),
     Queried("GetFinishedReason() -> FinishedReasonEndOfMedia") +
         Logged("Sending Finished - reason: 0") + Fired("Finished(EndOfMedia)")},
    {"FinishedForLackOfData", New<bdmv::FinishedEvent>(),
     FinishesFor(bdstreaming::FinishedReasonDataStarvation),
     Queried("GetFinishedReason() -> FinishedReasonDataStarvation") +
         Logged("Sending Finished - reason: 1") + Fired("Finished(DataStarvation)")},
    {"FinishedForAnUnknownReason", New<bdmv::FinishedEvent>(), FinishesFor(2),
     Queried("GetFinishedReason() -> 2") + assertion + Logged("Sending Finished - reason: 0") +
         Fired("Finished(EndOfMedia)")},
    {"FinishedForANegativeReason", New<bdmv::FinishedEvent>(), FinishesFor(-1),
     Queried("GetFinishedReason() -> -1") + assertion + Logged("Sending Finished - reason: 0") +
         Fired("Finished(EndOfMedia)")},
};

INSTANTIATE_TEST_SUITE_P(PlaybackState, EventScenario, testing::ValuesIn(playbackStateScenarios),
                         EventScenario::Name);

class PlaybackStateEvents : public EventTest
{
};

TEST_F(PlaybackStateEvents, SteppedWritesTheWholeJournal)
{
    context.currentTimePosition = 900000;
    context.playMode = bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedNormal);

    EXPECT_EQ(Dispatch<bdmv::SteppedEvent>(),
              "context.GetCurrentTimePosition() -> 900000\n"
              "context.GetPlayMode() -> (PlayDirectionBackward, PlaySpeedNormal)\n"
              "log? 57 5 0 -> on\n"
              "log 57 5 0: Sending Stepped - position: 900000,dir=1\n"
              "A.Stepped(900000, PlayDirectionBackward)\n"
              "B.Stepped(900000, PlayDirectionBackward)\n"
              "C.Stepped(900000, PlayDirectionBackward)\n");
}

TEST_F(PlaybackStateEvents, ContinuedReportsThePlayModesAsTheyWereWhenQueried)
{
    context.onQuery = [this](const std::string& operation) {
        if (operation == "GetPlayMode") {
            context.currentPlayMode = bd::PlayMode(bd::PlayDirectionForward, bd::PlaySpeedSlow1);
        }
    };
    context.currentPlayMode = bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedFast1);
    context.playMode = bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedFast2);
    WhenTheLogSwitchIsAsked(1, [this] { context.playMode = bd::PlayMode(); });

    EXPECT_EQ(Dispatch<bdmv::ContinuedEvent>(),
              Queried("GetCurrentPlayMode() -> (PlayDirectionBackward, PlaySpeedFast1)") +
                  Queried("GetPlayMode() -> (PlayDirectionBackward, PlaySpeedFast2)") +
                  Logged("Sending Continued with playmode: dir 1, speed 7 (currentplaymode: dir "
                         "1, speed 6)") +
                  Fired("Continued(PlayDirectionBackward, PlaySpeedFast2)"));
}

TEST_F(PlaybackStateEvents, SteppedReportsTheDirectionAsItWasBeforeTheLogLine)
{
    WhenTheLogSwitchIsAsked(1, [this] {
        context.playMode = bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedNormal);
    });

    EXPECT_EQ(Dispatch<bdmv::SteppedEvent>(),
              Queried("GetCurrentTimePosition() -> 0") +
                  Queried("GetPlayMode() -> (PlayDirectionForward, PlaySpeedNormal)") +
                  Logged("Sending Stepped - position: 0,dir=0") +
                  Fired("Stepped(0, PlayDirectionForward)"));
}

TEST_F(PlaybackStateEvents, AListenerThatChangesTheContextDoesNotChangeWhatTheOthersReceive)
{
    a.onCallback = [this](const std::string&) {
        context.currentTimePosition = 1;
        context.playMode = bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedFast1);
    };

    EXPECT_EQ(Dispatch<bdmv::SteppedEvent>(),
              Queried("GetCurrentTimePosition() -> 0") +
                  Queried("GetPlayMode() -> (PlayDirectionForward, PlaySpeedNormal)") +
                  Logged("Sending Stepped - position: 0,dir=0") +
                  Fired("Stepped(0, PlayDirectionForward)"));
}

TEST_F(PlaybackStateEvents, AnAssertionThatDoesNotReturnEndsTheFinishedEvent)
{
    struct Abandoned {
    };
    FinishesFor(2)(context);
    platform.onAssert = [] { throw Abandoned(); };

    EXPECT_THROW(Dispatch<bdmv::FinishedEvent>(), Abandoned);

    EXPECT_EQ(journal.Take(), Queried("GetFinishedReason() -> 2") + assertion);
}

} // namespace

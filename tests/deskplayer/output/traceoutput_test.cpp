#include "output/traceoutput.h"

#include <gtest/gtest.h>

#include <functional>
#include <map>
#include <optional>
#include <sstream>
#include <string>
#include <vector>

#include <nlohmann/json.hpp>

#include "kits/clientkit/everycallback.h"

namespace deskplayer
{
namespace
{

using nlohmann::json;

/** An event of a trace that has a time. */
struct TimedEvent {
    std::string phase;
    std::string track;
    std::uint64_t microseconds;
    std::string name;
    json arguments;
};

/** A trace as a viewer reads it. */
struct ReadTrace {
    std::vector<TimedEvent> events;
    std::map<int, std::string> tracks; ///< by their sort index

    /** Fails the test if a track has no name and sort index before its first event. */
    explicit ReadTrace(const json& trace)
    {
        std::map<int, std::string> names;
        std::map<int, int> sortIndices;
        for (const json& event : trace) {
            const std::string phase = event.at("ph");
            const std::string name = event.value("name", "");
            const json arguments = event.value("args", json());
            const int thread = event.at("tid");
            EXPECT_EQ(event.at("pid"), 1) << event;
            if (name == "thread_name") {
                EXPECT_TRUE(names.emplace(thread, arguments.at("name")).second) << event;
            } else if (name == "thread_sort_index") {
                EXPECT_TRUE(sortIndices.emplace(thread, arguments.at("sort_index")).second)
                    << event;
                tracks[arguments.at("sort_index")] = names.at(thread);
            } else if (phase != "M") {
                EXPECT_EQ(sortIndices.count(thread), 1U) << event;
                events.push_back({phase, names.at(thread), event.at("ts"), name, arguments});
            }
        }
    }
};

/** A session that is traced. */
class TracedSession
{
public:
    explicit TracedSession(const OutputFilter& filter = OutputFilter())
    {
        m_Output.emplace(m_Stream, m_Clock, filter);
    }

    bdmv::INavigatorListener* operator->() { return &*m_Output; }

    void Pass(Ticks time) { m_Clock.Advance(time); }
    void PassSecond() { Pass(std::chrono::seconds(1)); }

    /** Ends the session. */
    json Trace()
    {
        m_Output.reset();
        return json::parse(m_Stream.str());
    }

    /**
     * Ends the session and returns the slices of a track, with times in milliseconds:
     *
     *     "Playing 0-1000, Paused 1000-2000"
     */
    std::string Slices(const std::string& track)
    {
        std::string slices;
        for (const TimedEvent& event : ReadTrace(Trace()).events) {
            const std::string time = std::to_string(event.microseconds / 1000);
            if (event.track == track && event.phase == "B") {
                slices += (slices.empty() ? "" : ", ") + event.name + " " + time + "-";
            } else if (event.track == track && event.phase == "E") {
                slices += time;
            }
        }
        return slices;
    }

private:
    std::ostringstream m_Stream;
    VirtualClock m_Clock;
    std::optional<TraceOutput> m_Output;
};

/** The trace of a session that calls every callback three times, a second apart. */
std::vector<TimedEvent> EventsOfThreeRounds()
{
    TracedSession session;
    for (int round = 0; round < 3; ++round) {
        bdmvtest::CallEveryCallback(*session.operator->());
        session.PassSecond();
    }
    return ReadTrace(session.Trace()).events;
}

TEST(TraceOutput, IsValidForAnEmptySession)
{
    const json trace = TracedSession().Trace();

    ASSERT_EQ(trace.size(), 1U);
    EXPECT_EQ(trace[0].at("name"), "process_name");
}

TEST(TraceOutput, HasAnInstantForEveryCallbackOnTheTrackOfItsInterface)
{
    TracedSession session;
    bdmvtest::CallEveryCallback(*session.operator->());

    int instants = 0;
    for (const TimedEvent& event : ReadTrace(session.Trace()).events) {
        if (event.phase == "i") {
            const auto id = static_cast<bdmv::CallbackId>(instants++);
            ASSERT_LT(id, bdmv::Callback__sizeof);
            EXPECT_EQ(event.name, NameOf(id));
            EXPECT_EQ(event.track, NameOf(InterfaceOf(id))) << NameOf(id);
        }
    }
    EXPECT_EQ(instants, bdmv::Callback__sizeof);
}

TEST(TraceOutput, RestrictsInstantsToTheirTrack)
{
    TracedSession session;
    session->JumpOccurred();

    EXPECT_EQ(session.Trace().back().at("s"), "t");
}

TEST(TraceOutput, GivesTheArgumentsOfACallback)
{
    TracedSession session;
    session->AngleInfo(3);

    const ReadTrace trace(session.Trace());
    ASSERT_EQ(trace.events.size(), 3U); // begin of the slice, instant, end of the slice
    EXPECT_EQ(trace.events[0].arguments, json({{"number", 3}}));
    EXPECT_EQ(trace.events[1].arguments, json({{"number", 3}}));
}

TEST(TraceOutput, AlternatesBeginAndEndOnEveryTrack)
{
    std::map<std::string, int> open;
    for (const TimedEvent& event : EventsOfThreeRounds()) {
        if (event.phase == "B") {
            EXPECT_EQ(++open[event.track], 1) << event.track << ' ' << event.name;
        } else if (event.phase == "E") {
            EXPECT_EQ(--open[event.track], 0) << event.track;
        }
    }
    EXPECT_EQ(open.size(), 14U);
    for (const auto& [track, count] : open) {
        EXPECT_EQ(count, 0) << track;
    }
}

TEST(TraceOutput, GivesBothEndsOfASliceTheSameMembers)
{
    std::map<std::string, TimedEvent> open;
    for (const TimedEvent& event : EventsOfThreeRounds()) {
        if (event.phase == "B") {
            open.insert_or_assign(event.track, event);
        } else if (event.phase == "E") {
            EXPECT_EQ(event.name, open.at(event.track).name) << event.track;
            EXPECT_EQ(event.arguments, open.at(event.track).arguments) << event.track;
        }
    }
    EXPECT_EQ(open.size(), 14U);
}

TEST(TraceOutput, GivesBothEndsOfStandbyTheBlockThatIsGoneByThen)
{
    TracedSession session;
    std::vector<bd::UInt8> block = {0x00, 0xA5, 0xFF};
    session->SystemSuspended(block.data(), 3);
    block.assign(3, 0x11);
    session->SystemResumed(true);

    std::string data;
    for (const TimedEvent& event : ReadTrace(session.Trace()).events) {
        if (event.name == "Standby") {
            data += event.phase + event.arguments.at("data").get<std::string>() + " ";
        }
    }
    EXPECT_EQ(data, "B00a5ff E00a5ff ");
}

TEST(TraceOutput, HasTimesThatNeverDecrease)
{
    std::uint64_t last = 0;
    for (const TimedEvent& event : EventsOfThreeRounds()) {
        EXPECT_GE(event.microseconds, last) << event.track << ' ' << event.name;
        last = event.microseconds;
    }
    EXPECT_EQ(last, 3000000U);
}

TEST(TraceOutput, NamesAndPlacesEveryTrack)
{
    TracedSession session;
    bdmvtest::CallEveryCallback(*session.operator->());

    std::string tracks;
    for (const auto& [place, name] : ReadTrace(session.Trace()).tracks) {
        tracks += (tracks.empty() ? "" : ", ") + name;
    }
    EXPECT_EQ(tracks, "playback, play mode, play list, play item, chapter, video, audio, "
                      "subtitles, angle, interactive graphics, secondary video, secondary audio, "
                      "picture-in-picture subtitles, menu, control, settings, button, interactive");
}

TEST(TraceOutput, HasOnlyTracksWithEvents)
{
    TracedSession session;
    session->JumpOccurred();

    const std::map<int, std::string> tracks = ReadTrace(session.Trace()).tracks;
    ASSERT_EQ(tracks.size(), 1U);
    EXPECT_EQ(tracks.begin()->second, "control");
}

TEST(TraceOutput, GivesTimesInMicrosecondsRoundedToTheNearest)
{
    TracedSession session;
    session.Pass(Ticks(2)); // 44.44 microseconds
    session->JumpOccurred();
    session.Pass(Ticks(2)); // 88.89 microseconds
    session->JumpOccurred();

    const ReadTrace trace(session.Trace());
    ASSERT_EQ(trace.events.size(), 2U);
    EXPECT_EQ(trace.events[0].microseconds, 44U);
    EXPECT_EQ(trace.events[1].microseconds, 89U);
}

TEST(TraceOutput, ShowsPlayingPausedAndStill)
{
    TracedSession session;
    session->PlayStarted();
    session.PassSecond();
    session->Paused();
    session.PassSecond();
    session->Continued(bd::PlayDirectionForward, bd::PlaySpeedNormal);
    session.PassSecond();
    session->StillOn();
    session.PassSecond();
    session->StillOff();
    session.PassSecond();
    session->Stopped();

    EXPECT_EQ(session.Slices("playback"),
              "Playing 0-1000, Paused 1000-2000, Playing 2000-3000, Still 3000-4000, "
              "Playing 4000-5000");
}

TEST(TraceOutput, ShowsSuspendedAndStandby)
{
    TracedSession session;
    session->PlayStarted();
    session.PassSecond();
    session->Suspended();
    session.PassSecond();
    session->Resumed();
    session.PassSecond();
    session->SystemSuspended(nullptr, 0);
    session.PassSecond();
    session->SystemResumed(true);
    session.PassSecond();
    session->Stopped();

    EXPECT_EQ(session.Slices("playback"),
              "Playing 0-1000, Suspended 1000-2000, Playing 2000-3000, Standby 3000-4000, "
              "Playing 4000-5000");
}

TEST(TraceOutput, ReturnsToTheStateBeforeASuspension)
{
    TracedSession session;
    session->PlayStarted();
    session.PassSecond();
    session->Paused();
    session.PassSecond();
    session->Suspended();
    session.PassSecond();
    session->Resumed();
    session.PassSecond();
    session->StillOn();
    session.PassSecond();
    session->Suspended();
    session.PassSecond();
    session->Resumed();
    session.PassSecond();
    session->StillOff();
    session.PassSecond();
    session->Stopped();

    EXPECT_EQ(session.Slices("playback"),
              "Playing 0-1000, Paused 1000-2000, Suspended 2000-3000, Paused 3000-4000, "
              "Still 4000-5000, Suspended 5000-6000, Still 6000-7000, Playing 7000-8000");
}

TEST(TraceOutput, ShowsPlayingAfterASuspensionThatBeganBeforeIt)
{
    TracedSession session;
    session->Resumed();
    session.PassSecond();
    session->Stopped();

    EXPECT_EQ(session.Slices("playback"), "Playing 0-1000");
}

TEST(TraceOutput, IgnoresTheEndOfAStillThatPlaybackHasLeft)
{
    TracedSession session;
    session->StillOn();
    session.PassSecond();
    session->Stopped();
    session->StillOff();
    session.PassSecond();

    EXPECT_EQ(session.Slices("playback"), "Still 0-1000");
}

TEST(TraceOutput, EndsPlaybackWithEveryCallbackThatReportsItsEnd)
{
    const std::map<std::string, std::function<void(TracedSession&)>> ends = {
        {"PlayFailed", [](TracedSession& session) { session->PlayFailed(); }},
        {"Stopped", [](TracedSession& session) { session->Stopped(); }},
        {"Finished",
         [](TracedSession& session) { session->Finished(bdmv::INavControlListener::EndOfMedia); }},
        {"ResumeFailed", [](TracedSession& session) { session->ResumeFailed(); }},
        {"SystemResumed", [](TracedSession& session) { session->SystemResumed(false); }},
        {"SystemResumeFailed", [](TracedSession& session) { session->SystemResumeFailed(); }}};
    for (const auto& [name, end] : ends) {
        TracedSession session;
        session->PlayStarted();
        session.PassSecond();
        end(session);
        session.PassSecond();

        EXPECT_EQ(session.Slices("playback"), "Playing 0-1000") << name;
    }
}

TEST(TraceOutput, EndsTheSlicesOfPlaybackWithPlayback)
{
    for (const char* track : {"playback", "play mode", "play list", "play item", "chapter"}) {
        TracedSession session;
        bdmvtest::CallEveryCallback(*session.operator->());
        session->PlayStarted();
        session.PassSecond();
        session->Stopped();
        session.PassSecond();

        const std::string slices = session.Slices(track);
        EXPECT_EQ(slices.substr(slices.rfind('-')), "-1000") << track;
    }
}

TEST(TraceOutput, KeepsSelectedStreamsWhenPlaybackEnds)
{
    TracedSession session;
    session->AudioInfo(2);
    session.PassSecond();
    session->Stopped();
    session.PassSecond();

    EXPECT_EQ(session.Slices("audio"), "audio 2 0-2000");
}

TEST(TraceOutput, ShowsEveryStateByItsNumberOrName)
{
    const std::map<std::string, std::string> expected = {
        {"play mode", "Forward Slow1 0-1000"},
        {"play list", "play list 800 0-1000"},
        {"play item", "play item 2 0-1000"},
        {"chapter", "chapter 21 0-1000"},
        {"audio", "audio 11 0-1000"},
        {"video", "video 12 0-1000"},
        {"angle", "angle 13 0-1000"},
        {"interactive graphics", "interactive graphics 14 0-1000"},
        {"subtitles", "subtitles 15 0-1000"},
        {"secondary audio", "secondary audio 16 0-1000"},
        {"secondary video", "secondary video 17 0-1000"},
        {"picture-in-picture subtitles", "picture-in-picture subtitles 18 0-1000"}};
    for (const auto& [track, slices] : expected) {
        TracedSession session;
        bdmvtest::CallEveryCallback(*session.operator->());
        session.PassSecond();

        EXPECT_EQ(session.Slices(track), slices);
    }
}

TEST(TraceOutput, EndsTheSliceWhenNothingIsSelected)
{
    typedef bdmv::INavigatorListener Listener;
    const std::map<std::string, std::function<void(Listener&, bd::UInt8)>> callbacks = {
        {"chapter", [](Listener& l, bd::UInt8 number) { l.ChapterNumber(number); }},
        {"video", [](Listener& l, bd::UInt8 number) { l.VideoInfo(number); }},
        {"audio", [](Listener& l, bd::UInt8 number) { l.AudioInfo(number); }},
        {"angle", [](Listener& l, bd::UInt8 number) { l.AngleInfo(number); }},
        {"subtitles",
         [](Listener& l, bd::UInt8 number) { l.PresentationGraphicsInfo(number, true); }},
        {"interactive graphics",
         [](Listener& l, bd::UInt8 number) { l.InteractiveGraphicsInfo(number); }},
        {"secondary video", [](Listener& l, bd::UInt8 number) { l.SecondaryVideoInfo(number); }},
        {"secondary audio", [](Listener& l, bd::UInt8 number) { l.SecondaryAudioInfo(number); }},
        {"picture-in-picture subtitles",
         [](Listener& l, bd::UInt8 number) { l.PipPgTextStInfo(number, true); }}};
    for (const auto& [track, callBack] : callbacks) {
        TracedSession session;
        for (const bd::UInt8 number : std::vector<bd::UInt8>{0, 1, 0}) {
            callBack(*session.operator->(), number);
            session.PassSecond();
        }

        EXPECT_EQ(session.Slices(track), track + " 1 1000-2000");
    }
}

TEST(TraceOutput, CountsPlayListsAndPlayItemsFrom0)
{
    for (const char* const track : {"play list", "play item"}) {
        TracedSession session;
        session->Playlist(0);
        session->PlayItem(0, 0, bd::VideoFormatTypeNoInfo, bd::VideoAspectRatioTypeNoInfo);
        session.PassSecond();

        EXPECT_EQ(session.Slices(track), std::string(track) + " 0 0-1000");
    }
}

TEST(TraceOutput, BeginsASliceWithEveryCallbackOfItsTrack)
{
    TracedSession session;
    session->ChapterNumber(1);
    session.PassSecond();
    session->ChapterNumber(2);
    session.PassSecond();
    session->ChapterNumber(2);
    session.PassSecond();

    EXPECT_EQ(session.Slices("chapter"),
              "chapter 1 0-1000, chapter 2 1000-2000, chapter 2 2000-3000");
}

TEST(TraceOutput, ShowsTheMenuWhileItIsVisible)
{
    TracedSession session;
    session->InteractiveGraphicsVisible();
    session.PassSecond();
    session->InteractiveGraphicsInvisible();
    session.PassSecond();

    EXPECT_EQ(session.Slices("menu"), "Visible 0-1000");
}

TEST(TraceOutput, FiltersInstantsButNotSlices)
{
    OutputFilter filter;
    filter.KeepCallbacks("Stepped");
    TracedSession session(filter);
    session->PlayStarted();
    session.PassSecond();
    session->Paused();
    session->Stepped(45000, bd::PlayDirectionForward);

    std::string events;
    for (const TimedEvent& event : ReadTrace(session.Trace()).events) {
        events += event.phase + " " + event.name + ", ";
    }
    EXPECT_EQ(events, "B Playing, E Playing, B Paused, i Stepped, E Paused, ");
}

} // namespace
} // namespace deskplayer

#include "testdesk.h"

#include <gtest/gtest.h>

#include <sstream>
#include <stdexcept>
#include <utility>

#include "testkit/describe.h"
#include "testkit/fakeplatform.h"

namespace deskplayer
{

namespace
{

/** Twice the steps of a session of two hours that reports every second. */
constexpr int MostSteps = 30000;

std::string TimeOf(Ticks time)
{
    const std::string seconds = std::to_string(time / Second);
    const Ticks rest = time % Second;
    return rest == Ticks(0) ? seconds : seconds + "+" + std::to_string(rest.count());
}

/** The time as in a file, since clips in these tests start at ten minutes. */
std::uint32_t TimeInClip(Ticks time)
{
    return static_cast<std::uint32_t>((600 * Second + time).count());
}

} // namespace

Stream StreamOf(std::uint8_t codingType, std::uint16_t pid)
{
    Stream stream;
    stream.entryType = EntryTypePlayItem;
    stream.pid = pid;
    stream.attributes.codingType = codingType;
    return stream;
}

Stream StreamOfSubPath(std::uint8_t codingType, std::uint8_t subPath)
{
    Stream stream = StreamOf(codingType);
    stream.entryType = EntryTypeSubPath;
    stream.subPath = subPath;
    return stream;
}

PlayItem ItemOfTicks(Ticks duration)
{
    PlayItem item;
    item.inTime = TimeInClip(Ticks(0));
    item.outTime = TimeInClip(duration);
    Stream video = StreamOf(0x1B);
    video.attributes.videoFormat = bd::VideoFormatType1080p;
    video.attributes.frameRate = 6;
    item.streams.primaryVideo = {video};
    return item;
}

PlayItem Item(std::uint32_t seconds)
{
    return ItemOfTicks(std::chrono::seconds(seconds));
}

PlayItem WithTimedStill(PlayItem item, std::uint16_t seconds)
{
    item.stillMode = StillModeTimed;
    item.stillTime = seconds;
    return item;
}

PlayItem WithEndlessStill(PlayItem item)
{
    item.stillMode = StillModeEndless;
    return item;
}

PlayItem Forbidding(PlayItem item, const std::vector<bd::UserOperationMaskDef>& operations)
{
    item.uoMask |= MaskOf(operations);
    return item;
}

std::uint64_t MaskOf(const std::vector<bd::UserOperationMaskDef>& operations)
{
    std::uint64_t mask = 0;
    for (const bd::UserOperationMaskDef operation : operations) {
        mask |= std::uint64_t{1} << (63 - operation);
    }
    return mask;
}

PlayItem RichItem(std::uint32_t seconds)
{
    PlayItem item = Item(seconds);
    item.streams.primaryAudio = {StreamOf(CodingAc3, 0x1100), StreamOf(CodingLpcm, 0x1101)};
    item.streams.pg = {StreamOf(CodingGraphics), StreamOf(CodingTextSubtitle)};
    item.streams.pipPg = {StreamOf(CodingGraphics), StreamOf(CodingGraphics)};
    item.streams.ig = {StreamOf(CodingMenu), StreamOf(CodingMenu)};
    item.streams.secondaryAudio = {StreamOf(CodingEac3Secondary, 0x1A00),
                                   StreamOf(CodingEac3Secondary, 0x1A01)};
    item.streams.secondaryVideo = {StreamOf(0x1B), StreamOf(0x1B)};
    item.furtherAngles.resize(1);
    return item;
}

Mark Entry(std::uint16_t item, Ticks time)
{
    Mark mark;
    mark.type = MarkTypeEntry;
    mark.playItem = item;
    mark.time = TimeInClip(time);
    return mark;
}

Mark Link(std::uint16_t item, Ticks time)
{
    Mark mark = Entry(item, time);
    mark.type = MarkTypeLink;
    return mark;
}

PlayList ListOf(std::vector<PlayItem> items, std::vector<Mark> marks)
{
    PlayList playList;
    playList.playItems = std::move(items);
    playList.marks = std::move(marks);
    return playList;
}

TestDesk::TestDesk(PlayList playList) : desk(LayOut(7, std::move(playList)))
{
    m_Listener.onCallback = [this](const std::string& callback) {
        CountStep(callback);
        m_Received += TimeOf(clock.Now()) + " " + callback + "\n";
    };
    desk.Listeners().AddListener(&m_Listener);
}

void TestDesk::CountStep(const std::string& step)
{
    if (++m_Steps > MostSteps) {
        throw std::runtime_error("playback may never end: " + std::to_string(m_Steps) +
                                 " steps, the last at " + TimeOf(clock.Now()) + " s: " + step);
    }
}

SessionHooks TestDesk::Hooks()
{
    SessionHooks hooks;
    hooks.beforeTimePasses = [this](Ticks time) { CountStep("pass " + TimeOf(time) + " s"); };
    return hooks;
}

std::string TestDesk::Take()
{
    return std::exchange(m_Received, "");
}

std::string TestDesk::TakeWithoutPositions()
{
    std::istringstream received(Take());
    std::string others;
    for (std::string line; std::getline(received, line);) {
        if (line.find(" CurrentTimePosition(") == std::string::npos) {
            others += line + "\n";
        }
    }
    return others;
}

void TestDesk::Start(Ticks time)
{
    const Outcome outcome = navigator.Play();
    if (time > Ticks(0)) {
        navigator.Advance(time);
    }
    Do(outcome);
}

void TestDesk::Do(const Outcome& outcome)
{
    EXPECT_TRUE(outcome.IsDone()) << outcome.Reason();
    Take();
}

std::string TestDesk::Snapshot()
{
    using bdmvtest::Describe;

    struct Kind {
        const char* name;
        void (PlaybackContext::*get)(bd::StreamNumberDef*, bd::UInt8*);
    };
    std::ostringstream text;
    PrintTo(navigator.CurrentStatus(), &text);
    text << " item " << navigator.Context().GetPlayItemId() << " position "
         << navigator.Context().GetCurrentTimePosition() << " chapter "
         << navigator.Context().GetCurrentChapter() << " mode "
         << Describe(navigator.Context().GetPlayMode()) << " current mode "
         << Describe(navigator.Context().GetCurrentPlayMode()) << " repeat "
         << Describe(navigator.Context().GetCurrentABRepeatState()) << " "
         << Describe(navigator.Context().GetCurrentChpTitleRepeatState()) << " "
         << navigator.IsRepeating() << " trigger " << Describe(navigator.Context().GetTrigger())
         << " at " << navigator.TimeToNextChange().value_or(Ticks::max()).count();
    for (const Kind& kind : {Kind{"video", &PlaybackContext::GetVideoInfo},
                             Kind{"audio", &PlaybackContext::GetAudioInfo},
                             Kind{"subtitle", &PlaybackContext::GetPgTextStInfo},
                             Kind{"menu", &PlaybackContext::GetIgInfo},
                             Kind{"secondary audio", &PlaybackContext::GetSecondaryAudioInfo},
                             Kind{"pip subtitle", &PlaybackContext::GetPipPgTextStInfo}}) {
        bd::StreamNumberDef number = 0;
        bd::UInt8 count = 0;
        (navigator.Context().*kind.get)(&number, &count);
        text << " " << kind.name << " " << number << "/" << +count;
    }
    bd::StreamNumberDef number = 0;
    bd::AngleNumberDef angle = 0;
    bd::UInt8 count = 0;
    bool async = false;
    navigator.Context().GetSecondaryVideoInfo(&number, &count, &async);
    text << " secondary video " << number << "/" << +count << " " << async;
    navigator.Context().GetAngleInfo(&angle, &count);
    text << " angle " << +angle << "/" << +count;
    bd::ZOOM_PARAM_Def zoom;
    navigator.Context().GetZoomScaleInfo(zoom);
    text << " style " << +navigator.Context().GetCurrentTextSubtitleStyleNumber() << " shown "
         << navigator.Context().GetPgTextStDisplay()
         << navigator.Context().GetSecondaryVideoDisplay()
         << navigator.Context().GetSecondaryAudioDisplay()
         << navigator.Context().GetPipPgTextStSelect() << " zoom " << Describe(zoom);
    return text.str();
}

void PrintTo(const Outcome& outcome, std::ostream* stream)
{
    *stream << (outcome.IsDone() ? "done" : "refused: " + outcome.Reason());
}

void PrintTo(Status status, std::ostream* stream)
{
    static const char* const names[] = {"stopped",   "playing", "paused",  "still",
                                        "suspended", "standby", "finished"};
    *stream << names[static_cast<int>(status)];
}

} // namespace deskplayer

#include <vector>

#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "eventtest.h"

namespace
{

void Masks(Context& context, bd::UInt64 stored)
{
    context.uoMask = bdmv::UOMaskTable(stored);
}

void PassesMark(Context& context)
{
    context.playListId = 800;
    context.currentPLMarkId = 5;
    context.currentPLMarkTime = 6000000000;
}

const std::string markPassed = Queried("GetCurrentPLMarkId(18446744073709551615) -> 6000000000") +
                               Queried("GetCurrentPLMarkId returned 5") +
                               Queried("GetPlayListId() -> 800") +
                               Logged("Sending MarkInfo - markId: 5, time: 6000000000") +
                               Fired("MarkInfo(800, 5, 6000000000)");

const Scenario titlePositionScenarios[] = {
    {"Playlist", New<bdmv::PlaylistEvent>(), [](Context& context) { context.playListId = 800; },
     Queried("GetPlayListId() -> 800") + Logged("Sending Playlist - playListId: 800") +
         Fired("Playlist(800)")},
    {"PlaylistOf32Bits", New<bdmv::PlaylistEvent>(),
     [](Context& context) { context.playListId = 0xFFFFFFFF; },
     Queried("GetPlayListId() -> 4294967295") +
         Logged("Sending Playlist - playListId: 4294967295") + Fired("Playlist(4294967295)")},

    {"UOMask", New<bdmv::UOMaskEvent>(), [](Context& context) { Masks(context, 1); },
     Queried("GetUOMask(0) -> 9223372036854775808") +
         Logged("Sending UOMask - uoMask: 9223372036854775808") +
         Fired("UOMask(9223372036854775808)")},
    {"UOMaskOfSeveralBits", New<bdmv::UOMaskEvent>(),
     [](Context& context) { Masks(context, 0xC000000000000002ULL); },
     Queried("GetUOMask(0) -> 4611686018427387907") +
         Logged("Sending UOMask - uoMask: 4611686018427387907") +
         Fired("UOMask(4611686018427387907)")},
    {"UOMaskUntouched", New<bdmv::UOMaskEvent>(),
     [](Context& context) {
         Masks(context, 1);
         context.untouched = {"GetUOMask"};
     },
     Queried("GetUOMask(0) -> untouched") + Logged("Sending UOMask - uoMask: 0") +
         Fired("UOMask(0)")},

    {"Chapter", New<bdmv::ChapterEvent>(), [](Context& context) { context.currentChapter = 12; },
     Queried("GetCurrentChapter() -> 12") + Logged("Sending Chapter - chapterNumber: 12") +
         Fired("ChapterNumber(12)")},
    {"ChapterOf16Bits", New<bdmv::ChapterEvent>(),
     [](Context& context) { context.currentChapter = 65535; },
     Queried("GetCurrentChapter() -> 65535") + Logged("Sending Chapter - chapterNumber: 65535") +
         Fired("ChapterNumber(65535)")},

    {"MarkInfoOfAnEntryMark", New<bdmv::MarkInfoEvent>(bdmv::IPlayListMark::MarkTypeEntryMark),
     PassesMark, markPassed},
    {"MarkInfoOfALinkPoint", New<bdmv::MarkInfoEvent>(bdmv::IPlayListMark::MarkTypeLinkPoint),
     PassesMark, markPassed},
    {"MarkInfoUntouched", New<bdmv::MarkInfoEvent>(bdmv::IPlayListMark::MarkTypeEntryMark),
     [](Context& context) {
         PassesMark(context);
         context.currentPLMarkId = 65535;
         context.untouched = {"GetCurrentPLMarkId"};
     },
     Queried("GetCurrentPLMarkId(18446744073709551615) -> untouched") +
         Queried("GetCurrentPLMarkId returned 65535") + Queried("GetPlayListId() -> 800") +
         Logged("Sending MarkInfo - markId: 65535, time: 18446744073709551615") +
         Fired("MarkInfo(800, 65535, 18446744073709551615)")},
};

INSTANTIATE_TEST_SUITE_P(TitlePosition, EventScenario, testing::ValuesIn(titlePositionScenarios),
                         EventScenario::Name);

/** A secondary stream in the current and the previous play item, and the notification sent. */
struct Secondary {
    const char* name;
    bool currentAsync;
    bool previous;
    std::string sent;
};

const std::string pipAvailable =
    Logged("Send available for async 2nd video") + Fired("PictureInPictureAvailable()");
const std::string pipUnavailable =
    Logged("Send unavailable for 2nd video") + Fired("PictureInPictureUnavailable()");
const std::string audioAvailable =
    Logged("Send available for async 2nd audio") + Fired("SecondaryAudioAvailable()");
const std::string audioUnavailable =
    Logged("Send unavailable for 2nd audio") + Fired("SecondaryAudioUnavailable()");

const Secondary videos[] = {
    {"NoVideo", false, false, ""},
    {"PreviousVideo", false, true, pipUnavailable},
    {"AsyncVideo", true, false, pipAvailable},
    {"AsyncAndPreviousVideo", true, true, pipAvailable},
};

const Secondary audios[] = {
    {"NoAudio", false, false, ""},
    {"PreviousAudio", false, true, audioUnavailable},
    {"AsyncAudio", true, false, audioAvailable},
    {"AsyncAndPreviousAudio", true, true, audioAvailable},
};

void PlaysItem(Context& context)
{
    context.playListId = 0xFFFFFFFF;
    context.playItemId = 65535;
    context.videoFormat = bd::VideoFormatType720p;
    context.videoAspectRatio = bd::VideoAspectRatioType2_21x1;
}

const std::string itemPlayed =
    Queried("GetPlayListId() -> 4294967295") + Queried("GetPlayItemId() -> 65535") +
    Queried("GetVideoAttributes(VideoFormatTypeNoInfo, VideoAspectRatioTypeNoInfo) -> "
            "VideoFormatType720p, VideoAspectRatioType2_21x1") +
    Logged("Sending PlayItem - playListId: 4294967295, playItemId: 65535, videoFormat 5, "
           "aspectRatio 4") +
    Fired("PlayItem(4294967295, 65535, VideoFormatType720p, VideoAspectRatioType2_21x1)");

std::string Flag(bool value)
{
    return value ? "true" : "false";
}

std::vector<Scenario> PlayItemScenarios()
{
    std::vector<Scenario> all;
    for (const Secondary& video : videos) {
        for (const Secondary& audio : audios) {
            all.push_back({std::string(video.name) + audio.name, New<bdmv::PlayItemEvent>(),
                           [&video, &audio](Context& context) {
                               PlaysItem(context);
                               context.async2ndVid = video.currentAsync;
                               context.async2ndAud = audio.currentAsync;
                               context.prev2ndVid = video.previous;
                               context.prev2ndAud = audio.previous;
                           },
                           itemPlayed +
                               Queried("IsAsyncPipInCurrentPlayItem(false, false, false, false) "
                                       "-> " +
                                       Flag(video.currentAsync) + ", " + Flag(audio.currentAsync) +
                                       ", " + Flag(video.previous) + ", " + Flag(audio.previous)) +
                               video.sent + audio.sent});
        }
    }
    all.push_back(
        {"Untouched", New<bdmv::PlayItemEvent>(),
         [](Context& context) {
             context.playListId = 800;
             context.playItemId = 1;
             context.async2ndVid = context.prev2ndAud = true;
             context.untouched = {"GetVideoAttributes", "IsAsyncPipInCurrentPlayItem"};
         },
         Queried("GetPlayListId() -> 800") + Queried("GetPlayItemId() -> 1") +
             Queried("GetVideoAttributes(VideoFormatTypeNoInfo, VideoAspectRatioTypeNoInfo) -> "
                     "untouched") +
             Logged("Sending PlayItem - playListId: 800, playItemId: 1, videoFormat 15, "
                    "aspectRatio 15") +
             Fired("PlayItem(800, 1, VideoFormatTypeNoInfo, VideoAspectRatioTypeNoInfo)") +
             Queried("IsAsyncPipInCurrentPlayItem(false, false, false, false) -> "
                     "untouched")});
    return all;
}

INSTANTIATE_TEST_SUITE_P(PlayItem, EventScenario, testing::ValuesIn(PlayItemScenarios()),
                         EventScenario::Name);

class TitlePositionEvents : public EventTest
{
};

TEST_F(TitlePositionEvents, PlayItemQueriesTheFlagsAfterTheLastListenerReceivesThePlayItem)
{
    PlaysItem(context);
    c.onCallback = [this](const std::string&) { context.async2ndAud = true; };

    EXPECT_EQ(Dispatch<bdmv::PlayItemEvent>(),
              itemPlayed +
                  Queried("IsAsyncPipInCurrentPlayItem(false, false, false, false) -> false, "
                          "true, false, false") +
                  audioAvailable);
}

TEST_F(TitlePositionEvents, PlayItemQueriesTheFlagsOnce)
{
    PlaysItem(context);
    context.prev2ndVid = context.prev2ndAud = true;
    b.onCallback = [this](const std::string& callback) {
        if (callback == "PictureInPictureUnavailable()") {
            context.async2ndAud = true;
        }
    };

    EXPECT_EQ(Dispatch<bdmv::PlayItemEvent>(),
              itemPlayed +
                  Queried("IsAsyncPipInCurrentPlayItem(false, false, false, false) -> false, "
                          "false, true, true") +
                  pipUnavailable + audioUnavailable);
}

TEST_F(TitlePositionEvents, PlayItemAllowsListChangesBetweenItsCallbacks)
{
    PlaysItem(context);
    context.prev2ndVid = true;
    context.onQuery = [this](const std::string& operation) {
        if (operation == "IsAsyncPipInCurrentPlayItem") {
            listeners.RemoveListener(&a);
            listeners.AddListener(&a);
        }
    };

    EXPECT_EQ(Dispatch<bdmv::PlayItemEvent>(),
              itemPlayed +
                  Queried("IsAsyncPipInCurrentPlayItem(false, false, false, false) -> false, "
                          "false, true, false") +
                  Logged("Send unavailable for 2nd video") +
                  "B.PictureInPictureUnavailable()\n"
                  "C.PictureInPictureUnavailable()\n"
                  "A.PictureInPictureUnavailable()\n");
}

TEST_F(TitlePositionEvents, UOMaskComputesTheReportedFormOnceTheSwitchIsOn)
{
    Masks(context, 1);
    WhenTheLogSwitchIsAsked(1, [] { g_u1Bduopmask = 2; });

    EXPECT_EQ(Dispatch<bdmv::UOMaskEvent>(),
              Queried("GetUOMask(0) -> 9223372036854775808") +
                  Logged("Sending UOMask - uoMask: 18446744073709551615") +
                  Fired("UOMask(18446744073709551615)"));
}

TEST_F(TitlePositionEvents, UOMaskPassesTheStoredMaskWhateverTheOverride)
{
    struct Keeper : bdmv::NavigatorListenerAdapter {
        void UOMask(const bdmv::UOMaskTable& mask) override { masks.push_back(mask); }
        std::vector<bdmv::UOMaskTable> masks;
    } keeper;
    listeners.AddListener(&keeper);
    Masks(context, 1);
    g_u1Bduopmask = 1;

    EXPECT_EQ(Dispatch<bdmv::UOMaskEvent>(), Queried("GetUOMask(0) -> 0") +
                                                 Logged("Sending UOMask - uoMask: 0") +
                                                 Fired("UOMask(0)"));

    ASSERT_EQ(keeper.masks.size(), 1u);
    EXPECT_TRUE(keeper.masks[0] == bdmv::UOMaskTable(1));
}

} // namespace

#include <gtest/gtest.h>

#include "../testdesk.h"
#include "navigator/resumedata.h"

namespace deskplayer
{

namespace
{

/** A resume point in which all numbers differ. */
ResumePoint UnusualPoint()
{
    ResumePoint point;
    point.playList = 99999;
    point.playing = true;
    point.playItem = 0x090A;
    point.position = Ticks(0x0102030405060708);
    point.playMode = bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedFast12);
    point.selection.video = 11;
    point.selection.audio = 12;
    point.selection.ig = 13;
    point.selection.pg = 0x1415;
    point.selection.secondaryVideo = 16;
    point.selection.secondaryAudio = 17;
    point.selection.pipPg = 18;
    point.selection.angle = 19;
    point.selection.style = 20;
    point.selection.pgShown = false;
    point.selection.secondaryVideoShown = true;
    point.selection.secondaryAudioShown = false;
    point.selection.pipPgPicked = true;
    return point;
}

/** A block with the FNV-1a checksum of its bytes appended. */
std::vector<bd::UInt8> WithChecksum(std::vector<bd::UInt8> block)
{
    std::uint32_t sum = 2166136261U;
    for (const bd::UInt8 byte : block) {
        sum = (sum ^ byte) * 16777619U;
    }
    for (int shift = 24; shift >= 0; shift -= 8) {
        block.push_back(static_cast<bd::UInt8>(sum >> shift));
    }
    return block;
}

TEST(ResumeData, IsDecodedAsEncoded)
{
    const ResumePoint point = UnusualPoint();

    const std::optional<ResumePoint> read = ReadResumeData(MakeResumeData(point));

    ASSERT_TRUE(read);
    EXPECT_EQ(read->playList, point.playList);
    EXPECT_EQ(read->playing, point.playing);
    EXPECT_EQ(read->playItem, point.playItem);
    EXPECT_EQ(read->position, point.position);
    EXPECT_EQ(read->playMode, point.playMode);
    EXPECT_EQ(read->selection.video, point.selection.video);
    EXPECT_EQ(read->selection.audio, point.selection.audio);
    EXPECT_EQ(read->selection.ig, point.selection.ig);
    EXPECT_EQ(read->selection.pg, point.selection.pg);
    EXPECT_EQ(read->selection.secondaryVideo, point.selection.secondaryVideo);
    EXPECT_EQ(read->selection.secondaryAudio, point.selection.secondaryAudio);
    EXPECT_EQ(read->selection.pipPg, point.selection.pipPg);
    EXPECT_EQ(read->selection.angle, point.selection.angle);
    EXPECT_EQ(read->selection.style, point.selection.style);
    EXPECT_EQ(read->selection.pgShown, point.selection.pgShown);
    EXPECT_EQ(read->selection.secondaryVideoShown, point.selection.secondaryVideoShown);
    EXPECT_EQ(read->selection.secondaryAudioShown, point.selection.secondaryAudioShown);
    EXPECT_EQ(read->selection.pipPgPicked, point.selection.pipPgPicked);
}

TEST(ResumeData, DistinguishesTheFlags)
{
    bool StreamSelection::*const flags[] = {
        &StreamSelection::pgShown, &StreamSelection::secondaryVideoShown,
        &StreamSelection::secondaryAudioShown, &StreamSelection::pipPgPicked};
    for (bool StreamSelection::*const set : flags) {
        ResumePoint point;
        for (bool StreamSelection::*const flag : flags) {
            point.selection.*flag = flag == set;
        }
        const std::optional<ResumePoint> read = ReadResumeData(MakeResumeData(point));
        ASSERT_TRUE(read);
        for (bool StreamSelection::*const flag : flags) {
            EXPECT_EQ(read->selection.*flag, flag == set);
        }
    }
}

TEST(ResumeData, HasTheSameBytesOnEveryMachine)
{
    const std::vector<bd::UInt8> expected = {
        'B', 'D',  'R',  '1',                     // magic number
        0,   0x01, 0x86, 0x9F,                    // play list
        1,                                        // playing
        9,   10,                                  // play item
        1,   2,    3,    4,    5, 6,  7,    8,    // position
        0,   0,    0,    1,    0, 0,  0,    17,   // play mode
        0,   11,   0,    12,   0, 13, 0x14, 0x15, // video, audio, menu, subtitles
        0,   16,   0,    17,   0, 18, // secondary video and audio, picture-in-picture subtitles
        19,  20,   0,    1,    0, 1}; // angle, style, display flags

    EXPECT_EQ(MakeResumeData(UnusualPoint()), WithChecksum(expected));
}

TEST(ResumeData, IsRefusedIfItIsAnotherKindOfBlock)
{
    std::vector<bd::UInt8> block = MakeResumeData(UnusualPoint());
    block.resize(block.size() - 4);
    ASSERT_TRUE(ReadResumeData(WithChecksum(block)));

    block[3] = '2';

    EXPECT_FALSE(ReadResumeData(WithChecksum(block)));
}

TEST(ResumeData, IsRefusedIfABitIsDamaged)
{
    const std::vector<bd::UInt8> block = MakeResumeData(UnusualPoint());
    for (std::size_t bit = 0; bit < 8 * block.size(); ++bit) {
        std::vector<bd::UInt8> damaged = block;
        damaged[bit / 8] = static_cast<bd::UInt8>(damaged[bit / 8] ^ 1 << bit % 8);
        EXPECT_FALSE(ReadResumeData(damaged)) << bit;
    }
}

TEST(ResumeData, IsRefusedInAnyOtherSize)
{
    const std::vector<bd::UInt8> block = MakeResumeData(ResumePoint());
    for (std::size_t size = 0; size <= block.size() + 8; ++size) {
        std::vector<bd::UInt8> other = block;
        other.resize(size);
        EXPECT_EQ(ReadResumeData(other).has_value(), size == block.size()) << size;
    }
}

TEST(ResumeDataKeeper, KeepsACopyOfTheLastBlock)
{
    ResumeDataKeeper keeper;
    EXPECT_TRUE(keeper.ResumeData().empty());

    bd::UInt8 block[] = {1, 2, 3};
    keeper.SystemSuspended(block, 3);
    block[0] = 9;
    EXPECT_EQ(keeper.ResumeData(), (std::vector<bd::UInt8>{1, 2, 3}));

    keeper.SystemSuspended(block, 1);
    EXPECT_EQ(keeper.ResumeData(), std::vector<bd::UInt8>{9});

    keeper.SystemSuspended(nullptr, 0);
    EXPECT_TRUE(keeper.ResumeData().empty());
}

TEST(Standby, PassesOnTheResumeDataAndDiscardsIt)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start(4 * Second);

    EXPECT_TRUE(desk.navigator.GoToStandby().IsDone());

    const std::string received = desk.Take();
    EXPECT_EQ(received.rfind("4 SystemSuspended(bytes 66 68 82 49 ", 0), 0) << received;
    EXPECT_EQ(std::count(received.begin(), received.end(), '\n'), 1);
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Standby);
    EXPECT_EQ(desk.navigator.Context().GetSystemResumeData().size, 0);
    const std::optional<ResumePoint> point = ReadResumeData(desk.desk.ResumeData());
    ASSERT_TRUE(point);
    EXPECT_EQ(point->playList, 7);
    EXPECT_EQ(point->position, 4 * Second);
    EXPECT_TRUE(point->playing);
}

TEST(Standby, LastsUntilWakeUp)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start(4 * Second);
    desk.Do(desk.navigator.GoToStandby());

    EXPECT_EQ(desk.navigator.TimeToNextChange(), std::nullopt);
    EXPECT_EQ(desk.navigator.Advance(1000000 * Second), Ticks(0));

    EXPECT_EQ(desk.Take(), "");
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Standby);
}

TEST(Standby, ClosesTheMenuAndEndsAStill)
{
    TestDesk desk(ListOf({WithTimedStill(RichItem(1), 5)}));
    desk.Start(2 * Second);
    desk.Do(desk.navigator.OpenPopUpMenu());

    desk.navigator.GoToStandby();

    EXPECT_EQ(desk.Take().rfind("2 InteractiveGraphicsInvisible()\n"
                                "2 InteractiveGraphicsInactive()\n"
                                "2 SystemSuspended(",
                                0),
              0);
}

TEST(Standby, RestoresPositionStreamsAndPlayMode)
{
    PlayList playList = ListOf({Item(2), RichItem(10)}, {Entry(0, Ticks(0)), Entry(1, Ticks(0))});
    TestDesk desk(playList);
    desk.Start(5 * Second + Ticks(7));
    desk.Do(desk.navigator.SelectAudio(2));
    desk.Do(desk.navigator.ShowSubtitles(false));
    desk.Do(desk.navigator.SetPlayMode(bd::PlayMode(bd::PlayDirectionForward, bd::PlaySpeedSlow1)));
    const std::string before = desk.Snapshot();
    desk.Do(desk.navigator.GoToStandby());
    desk.navigator.Advance(60 * Second);

    EXPECT_TRUE(desk.navigator.WakeUp(desk.desk.ResumeData()).IsDone());

    EXPECT_EQ(desk.Take(),
              "65+7 SystemResumed(true)\n"
              "65+7 Playlist(7)\n"
              "65+7 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "65+7 VideoInfo(1)\n"
              "65+7 AudioInfo(2)\n"
              "65+7 AngleInfo(1)\n"
              "65+7 PresentationGraphicsInfo(1, false)\n"
              "65+7 SecondaryVideoInfo(1)\n"
              "65+7 SecondaryVideoDisplay(1, false)\n"
              "65+7 SecondaryAudioInfo(1)\n"
              "65+7 SecondaryAudioDisplay(1, false)\n"
              "65+7 PipPgTextStInfo(1, false)\n"
              "65+7 InteractiveGraphicsInfo(1)\n"
              "65+7 AudioInfoChanged(true, (AudioFormatPcm, AudioSampleRateUnknown, "
              "AudioBitsPerSamplingTypeInvalid, AudioChannelTypeUnknown, 4353, 0))\n"
              "65+7 AudioInfoChanged(false, (AudioFormatEac3Sec, AudioSampleRateUnknown, "
              "AudioBitsPerSamplingTypeInvalid, AudioChannelTypeUnknown, 6656, 0))\n"
              "65+7 TextSubtitleStylesAvailable(4)\n"
              "65+7 TextSubtitleStyleInfo(1)\n"
              "65+7 UOMask(0)\n"
              "65+7 PopUpMenuAvailable()\n"
              "65+7 PlayMode(PlayDirectionForward, PlaySpeedSlow1)\n"
              "65+7 ChapterNumber(2)\n"
              "65+7 CurrentTimePosition(225007)\n");
    EXPECT_EQ(desk.Snapshot(), before);

    TestDesk restarted(playList);
    restarted.Start();
    restarted.Do(restarted.navigator.GoToStandby());
    restarted.Do(restarted.navigator.WakeUp(desk.desk.ResumeData()));
    EXPECT_EQ(restarted.Snapshot(), before) << "in another navigator with the same play list";
}

TEST(Standby, RestoresAPause)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start(4 * Second);
    desk.Do(desk.navigator.Pause());
    desk.Do(desk.navigator.GoToStandby());

    desk.navigator.WakeUp(desk.desk.ResumeData());

    EXPECT_EQ(desk.Take().rfind("4 SystemResumed(false)\n", 0), 0);
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Paused);
    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), 4 * Second);
}

TEST(Standby, RestoresAStill)
{
    TestDesk desk(ListOf({WithTimedStill(Item(1), 5)}));
    desk.Start(2 * Second);
    desk.Do(desk.navigator.GoToStandby());
    desk.Do(desk.navigator.WakeUp(desk.desk.ResumeData()));

    desk.navigator.Advance(10 * Second);

    EXPECT_EQ(desk.TakeWithoutPositions(), "2 StillOn()\n"
                                           "7 StillOff()\n"
                                           "7 Finished(EndOfMedia)\n");
}

TEST(Standby, RestoresThePositionInEveryItem)
{
    const PlayList playList = ListOf(
        {Item(2), Item(0), WithTimedStill(Item(2), 5), WithTimedStill(Item(0), 5), RichItem(2)},
        {Entry(0, Ticks(0)), Entry(2, Ticks(0)), Entry(4, Ticks(0))});
    for (std::uint64_t time = 0; time < 16; ++time) {
        SCOPED_TRACE(time);
        TestDesk desk(playList);
        desk.Start(time * Second + Ticks(22500));
        const std::string before = desk.Snapshot();
        const std::size_t size = // a still starts again with its full time
            desk.navigator.CurrentStatus() == Status::Still ? before.find(" at ") : before.size();
        desk.Do(desk.navigator.GoToStandby());

        desk.Do(desk.navigator.WakeUp(desk.desk.ResumeData()));
        desk.navigator.Advance(Ticks(0));

        EXPECT_EQ(desk.Snapshot().substr(0, size), before.substr(0, size));
    }
}

TEST(Standby, AnnouncesThePlayModeRequestedWhilePaused)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start(Second);
    desk.Do(desk.navigator.Pause());
    desk.Do(desk.navigator.SetPlayMode(bd::PlayMode(bd::PlayDirectionForward, bd::PlaySpeedSlow1)));
    desk.Do(desk.navigator.GoToStandby());
    desk.Do(desk.navigator.WakeUp(desk.desk.ResumeData()));

    desk.navigator.Continue();

    EXPECT_EQ(desk.Take(), "1 Continued(PlayDirectionForward, PlaySpeedSlow1)\n"
                           "1 PlayMode(PlayDirectionForward, PlaySpeedSlow1)\n");
}

TEST(Standby, EndsARepeat)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start();
    desk.Do(desk.navigator.RepeatTitle());
    desk.Do(desk.navigator.GoToStandby());
    desk.Do(desk.navigator.WakeUp(desk.desk.ResumeData()));

    EXPECT_FALSE(desk.navigator.IsRepeating());
}

TEST(Standby, StopsPlaybackIfTheResumeDataIsInvalid)
{
    ResumePoint ofAnotherPlayList;
    ofAnotherPlayList.playList = 8;
    ResumePoint behindTheEnd;
    behindTheEnd.playList = 7;
    behindTheEnd.playItem = 1;
    behindTheEnd.position = 10 * Second + Ticks(1);
    ResumePoint beforeItsItem;
    beforeItsItem.playList = 7;
    beforeItsItem.playItem = 1;
    beforeItsItem.position = 5 * Second - Ticks(1);
    ResumePoint behindItsItem;
    behindItsItem.playList = 7;
    behindItsItem.position = 5 * Second + Ticks(1);
    ResumePoint inNoItem = beforeItsItem;
    inNoItem.playItem = 2;
    std::vector<bd::UInt8> damaged = MakeResumeData(ResumePoint());
    damaged.back() ^= 1;
    for (const std::vector<bd::UInt8>& data :
         {std::vector<bd::UInt8>(), std::vector<bd::UInt8>(damaged.size(), 0), damaged,
          MakeResumeData(ofAnotherPlayList), MakeResumeData(behindTheEnd),
          MakeResumeData(beforeItsItem), MakeResumeData(behindItsItem), MakeResumeData(inNoItem)}) {
        TestDesk desk(ListOf({Item(5), Item(5)}));
        desk.Start(Second);
        desk.Do(desk.navigator.GoToStandby());

        EXPECT_TRUE(desk.navigator.WakeUp(data).IsDone());

        EXPECT_EQ(desk.Take(), "1 SystemResumeFailed()\n");
        EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Stopped);
        desk.Start();
        EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Playing);
    }
}

} // namespace

} // namespace deskplayer

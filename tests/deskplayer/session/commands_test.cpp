#include "session/commands.h"

#include <gtest/gtest.h>

#include <set>

#include "../testdesk.h"

namespace deskplayer
{

namespace
{

/** An item that supports every command, with chapters at 0 and 5 s, and one that ends in a still.
 */
PlayList TwoItems()
{
    return ListOf({RichItem(10), WithEndlessStill(RichItem(10))},
                  {Entry(0, Ticks(0)), Entry(0, 5 * Second)});
}

/** Carries out a script whose lines all have the same time. */
Outcome Perform(TestDesk& desk, const std::string& script)
{
    Outcome outcome = Outcome::Done();
    for (const ScriptStep& step : ParseScript(script, "a.session", CommandSyntaxes())) {
        outcome = Commands()[step.command].perform(desk.desk, step.values);
    }
    return outcome;
}

/** A command and its callbacks, a second after the preparation. */
struct Example {
    const char* pattern; ///< the command that it is an example of
    const char* line;
    const char* preparation;
    const char* received;
};

const Example Examples[] = {
    {"play", "play", "fail play", "0 PlayFailed()\n"},
    {"stop", "stop", "play", "1 Stopped()\n"},
    {"pause", "pause", "play", "1 Paused()\n"},
    {"continue", "continue", "play\npause", "1 Continued(PlayDirectionForward, PlaySpeedNormal)\n"},
    {"step", "step", "play\npause", "1 Stepped(900, PlayDirectionForward)\n"},
    {"forward", "forward", "play\nforward fast 1",
     "1 PlayMode(PlayDirectionForward, PlaySpeedNormal)\n"
     "1 PictureInPictureAvailable()\n"
     "1 SecondaryAudioAvailable()\n"},
    {"forward fast NUMBER", "forward fast 2", "play\nforward fast 1",
     "1 PlayMode(PlayDirectionForward, PlaySpeedFast2)\n"},
    {"forward slow NUMBER", "forward slow 2", "play\nforward fast 1",
     "1 PlayMode(PlayDirectionForward, PlaySpeedSlow2)\n"},
    {"backward", "backward", "play", "1 PlayMode(PlayDirectionBackward, PlaySpeedNormal)\n"},
    {"backward fast NUMBER", "backward fast 12", "play\nforward fast 1",
     "1 PlayMode(PlayDirectionBackward, PlaySpeedFast12)\n"},
    {"backward slow NUMBER", "backward slow 5", "play\nforward fast 1",
     "1 PlayMode(PlayDirectionBackward, PlaySpeedSlow5)\n"},
    {"still off", "still off", "play\nseek 19.5",
     "1 StillOff()\n"
     "1 Finished(EndOfMedia)\n"},
    {"suspend", "suspend", "play", "1 Suspended()\n"},
    {"resume", "resume", "play\nsuspend", "1 Resumed()\n"},
    {"seek TIME", "seek 7.5", "play",
     "1 JumpOccurred()\n"
     "1 ChapterNumber(2)\n"
     "1 CurrentTimePosition(337500)\n"},
    {"chapter next", "chapter next", "play",
     "1 JumpOccurred()\n"
     "1 MarkInfo(7, 1, 225000)\n"
     "1 ChapterNumber(2)\n"
     "1 CurrentTimePosition(225000)\n"},
    {"chapter previous", "chapter previous", "play\nseek 8.5",
     "1 JumpOccurred()\n"
     "1 MarkInfo(7, 1, 225000)\n"
     "1 CurrentTimePosition(225000)\n"},
    {"chapter NUMBER", "chapter 2", "play",
     "1 JumpOccurred()\n"
     "1 MarkInfo(7, 1, 225000)\n"
     "1 ChapterNumber(2)\n"
     "1 CurrentTimePosition(225000)\n"},
    {"repeat a", "repeat a", "play", "1 TriggerSet(TRIGGER_A, true)\n"},
    {"repeat b", "repeat b", "play\nrepeat a",
     "1 TriggerSet(TRIGGER_B, true)\n"
     "1 TriggerTimeReached(TRIGGER_B, 45000)\n"
     "1 JumpOccurred()\n"
     "1 MarkInfo(7, 0, 0)\n"
     "1 CurrentTimePosition(0)\n"},
    {"repeat ab off", "repeat ab off", "play\nrepeat a", "1 TriggerSet(TRIGGER_AB_NONE, true)\n"},
    {"repeat chapter", "repeat chapter", "play", "1 TriggerSet(TRIGGER_CHP, true)\n"},
    {"repeat title", "repeat title", "play", "1 TriggerSet(TRIGGER_TITLE, true)\n"},
    {"repeat off", "repeat off", "play\nrepeat title", "1 TriggerSet(TRIGGER_NONE, true)\n"},
    {"trigger TIME", "trigger 5", "play", "1 TriggerSet(TRIGGER_NOTIFY_FROM_CURPOS, true)\n"},
    {"audio NUMBER", "audio 2", "play",
     "1 AudioInfo(2)\n"
     "1 AudioInfoChanged(true, (AudioFormatPcm, AudioSampleRateUnknown, "
     "AudioBitsPerSamplingTypeInvalid, AudioChannelTypeUnknown, 4353, 0))\n"},
    {"audio next", "audio next", "play\naudio 2",
     "1 AudioInfo(1)\n"
     "1 AudioInfoChanged(true, (AudioFormatAc3, AudioSampleRateUnknown, "
     "AudioBitsPerSamplingTypeInvalid, AudioChannelTypeUnknown, 4352, 0))\n"},
    {"subtitle on", "subtitle on", "play", "1 PresentationGraphicsDisplay(true)\n"},
    {"subtitle off", "subtitle off", "play", "1 PresentationGraphicsDisplay(false)\n"},
    {"subtitle next", "subtitle next", "play", "1 PresentationGraphicsInfo(2, true)\n"},
    {"subtitle style NUMBER", "subtitle style 3", "play", "1 TextSubtitleStyleInfo(3)\n"},
    {"subtitle NUMBER", "subtitle 2", "play", "1 PresentationGraphicsInfo(2, true)\n"},
    {"angle NUMBER", "angle 2", "play", "1 AngleInfo(2)\n"},
    {"angle next", "angle next", "play\nangle 2", "1 AngleInfo(1)\n"},
    {"pip on", "pip on", "play", "1 SecondaryVideoDisplay(1, true)\n"},
    {"pip off", "pip off", "play\npip on", "1 SecondaryVideoDisplay(1, false)\n"},
    {"pip audio on", "pip audio on", "play", "1 SecondaryAudioDisplay(1, true)\n"},
    {"pip audio off", "pip audio off", "play\npip audio on", "1 SecondaryAudioDisplay(1, false)\n"},
    {"pip audio NUMBER", "pip audio 2", "play",
     "1 SecondaryAudioInfo(2)\n"
     "1 SecondaryAudioDisplay(2, false)\n"
     "1 AudioInfoChanged(false, (AudioFormatEac3Sec, AudioSampleRateUnknown, "
     "AudioBitsPerSamplingTypeInvalid, AudioChannelTypeUnknown, 6657, 0))\n"},
    {"pip subtitle on", "pip subtitle on", "play", "1 PipPgTextSelect(true)\n"},
    {"pip subtitle off", "pip subtitle off", "play\npip subtitle on", "1 PipPgTextSelect(false)\n"},
    {"pip subtitle NUMBER", "pip subtitle 2", "play", "1 PipPgTextStInfo(2, false)\n"},
    {"pip NUMBER", "pip 2", "play",
     "1 SecondaryVideoInfo(2)\n"
     "1 SecondaryVideoDisplay(2, false)\n"},
    {"zoom off", "zoom off", "play\nzoom 1 2 3 4",
     "1 ZoomModeSet(((0, 0, 1920, 1080), (0, 0, 1920, 1080), 0))\n"},
    {"zoom NUMBER NUMBER NUMBER NUMBER", "zoom 1 2 3 4", "play",
     "1 ZoomModeSet(((1, 2, 3, 4), (0, 0, 1920, 1080), 0))\n"},
    {"menu on", "menu on", "play",
     "1 InteractiveGraphicsActive()\n"
     "1 InteractiveGraphicsVisible()\n"},
    {"menu off", "menu off", "play\nmenu on",
     "1 InteractiveGraphicsInvisible()\n"
     "1 InteractiveGraphicsInactive()\n"},
    {"button previous", "button previous\nbutton activate", "play\nmenu on\nbutton 2",
     "1 ButtonActivationBusy()\n"
     "1 ExecuteButton(1, 1, program shared by 2)\n"
     "1 ButtonActivationDone()\n"
     "1 InteractiveGraphicsInvisible()\n"
     "1 InteractiveGraphicsInactive()\n"
     "1 JumpOccurred()\n"
     "1 MarkInfo(7, 0, 0)\n"
     "1 CurrentTimePosition(0)\n"},
    {"button next", "button next\nbutton activate", "play\nmenu on",
     "1 ButtonActivationBusy()\n"
     "1 ExecuteButton(1, 2, program shared by 2)\n"
     "1 ButtonActivationDone()\n"
     "1 InteractiveGraphicsInvisible()\n"
     "1 InteractiveGraphicsInactive()\n"
     "1 JumpOccurred()\n"
     "1 MarkInfo(7, 1, 225000)\n"
     "1 ChapterNumber(2)\n"
     "1 CurrentTimePosition(225000)\n"},
    {"button activate", "button activate", "play\nmenu on",
     "1 ButtonActivationBusy()\n"
     "1 ExecuteButton(1, 1, program shared by 2)\n"
     "1 ButtonActivationDone()\n"
     "1 InteractiveGraphicsInvisible()\n"
     "1 InteractiveGraphicsInactive()\n"
     "1 JumpOccurred()\n"
     "1 MarkInfo(7, 0, 0)\n"
     "1 CurrentTimePosition(0)\n"},
    {"button activate NUMBER", "button activate 2", "play\nmenu on",
     "1 ButtonActivationBusy()\n"
     "1 ExecuteButton(1, 2, program shared by 2)\n"
     "1 ButtonActivationDone()\n"
     "1 InteractiveGraphicsInvisible()\n"
     "1 InteractiveGraphicsInactive()\n"
     "1 JumpOccurred()\n"
     "1 MarkInfo(7, 1, 225000)\n"
     "1 ChapterNumber(2)\n"
     "1 CurrentTimePosition(225000)\n"},
    {"button NUMBER", "button 2\nbutton activate", "play\nmenu on",
     "1 ButtonActivationBusy()\n"
     "1 ExecuteButton(1, 2, program shared by 2)\n"
     "1 ButtonActivationDone()\n"
     "1 InteractiveGraphicsInvisible()\n"
     "1 InteractiveGraphicsInactive()\n"
     "1 JumpOccurred()\n"
     "1 MarkInfo(7, 1, 225000)\n"
     "1 ChapterNumber(2)\n"
     "1 CurrentTimePosition(225000)\n"},
    {"wake without data", "wake without data", "play\nstandby", "1 SystemResumeFailed()\n"},
    {"fail play", "fail play\nplay", "", "0 PlayFailed()\n"},
    {"fail resume", "fail resume\nresume", "play\nsuspend", "1 ResumeFailed()\n"},
    {"fail preload", "fail preload", "play", "1 PreloadFailed()\n"},
    {"fail stream", "fail stream", "play", "1 Finished(DataStarvation)\n"},
};

/** Commands with more callbacks than an example should list. */
const char* const OtherCommands[] = {"standby", "wake"};

TEST(Commands, DoWhatTheirHelpSays)
{
    for (const Example& example : Examples) {
        SCOPED_TRACE(example.line);
        TestDesk desk(TwoItems());
        Perform(desk, example.preparation);
        desk.navigator.Advance(Second);
        desk.Take();

        const Outcome outcome = Perform(desk, example.line);

        EXPECT_TRUE(outcome.IsDone()) << outcome.Reason();
        EXPECT_EQ(desk.Take(), example.received);
    }
}

TEST(Commands, AreAllCoveredByExamples)
{
    std::set<std::string_view> patterns(std::begin(OtherCommands), std::end(OtherCommands));
    for (const Example& example : Examples) {
        patterns.insert(example.pattern);
        const std::vector<ScriptStep> steps =
            ParseScript(example.line, "a.session", CommandSyntaxes());
        EXPECT_EQ(CommandSyntaxes()[steps.front().command].pattern, example.pattern)
            << example.line;
    }

    patterns.insert("expect nothing"); // expectations are not performed
    patterns.insert("expect CALLBACK [ARGUMENT=VALUE ...]");
    std::set<std::string_view> all;
    for (const CommandSyntax& syntax : CommandSyntaxes()) {
        EXPECT_TRUE(all.insert(syntax.pattern).second) << syntax.pattern << " occurs twice";
        EXPECT_FALSE(syntax.help.empty()) << syntax.pattern;
    }
    EXPECT_EQ(patterns, all);
    EXPECT_EQ(Commands().size() + 2, CommandSyntaxes().size());
}

TEST(Commands, AreNotExpectations)
{
    const std::vector<ScriptStep> steps =
        ParseScript("fail stream\nexpect nothing\nexpect Paused", "a.session", CommandSyntaxes());

    EXPECT_FALSE(IsExpectation(steps[0]));
    EXPECT_TRUE(IsExpectation(steps[1]));
    EXPECT_TRUE(IsExpectation(steps[2]));
}

TEST(Commands, GoToStandbyAndWakeUpWithTheStoredData)
{
    TestDesk desk(TwoItems());
    desk.Do(Perform(desk, "play\nseek 12"));
    const std::string before = desk.Snapshot();

    EXPECT_TRUE(Perform(desk, "standby").IsDone());
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Standby);
    EXPECT_TRUE(Perform(desk, "wake").IsDone());

    EXPECT_EQ(desk.Snapshot(), before);
}

TEST(Commands, PlayAtEveryValidSpeedAndNoOther)
{
    const struct {
        const char* words;
        bd::PlayDirectionDef direction;
        int sign; ///< +1 fast, -1 slow
        int steps;
        const char* refusal;
    } kinds[] = {
        {"forward fast ", bd::PlayDirectionForward, 1, 12, "fast speeds are numbered 1 to 12"},
        {"forward slow ", bd::PlayDirectionForward, -1, 5, "slow speeds are numbered 1 to 5"},
        {"backward fast ", bd::PlayDirectionBackward, 1, 12, "fast speeds are numbered 1 to 12"},
        {"backward slow ", bd::PlayDirectionBackward, -1, 5, "slow speeds are numbered 1 to 5"}};
    for (const auto& kind : kinds) {
        SCOPED_TRACE(kind.words);
        TestDesk desk(TwoItems());
        desk.Start(Second);
        for (int step = 1; step <= kind.steps; ++step) {
            desk.Do(Perform(desk, kind.words + std::to_string(step)));
            const bd::PlayMode& mode = desk.navigator.Context().GetCurrentPlayMode();
            EXPECT_EQ(mode.Direction(), kind.direction);
            EXPECT_EQ(mode.Speed(), bd::PlaySpeedNormal + kind.sign * step);
        }
        const std::string before = desk.Snapshot();
        for (const int step : {0, kind.steps + 1, 65535}) {
            EXPECT_EQ(Perform(desk, kind.words + std::to_string(step)).Reason(), kind.refusal);
        }
        EXPECT_EQ(desk.Take(), "");
        EXPECT_EQ(desk.Snapshot(), before);
    }
}

TEST(Commands, CycleThroughTheStreams)
{
    const struct {
        const char* line;
        const char* received;
    } kinds[] = {{"audio next", "0 AudioInfo("},
                 {"subtitle next", "0 PresentationGraphicsInfo("},
                 {"angle next", "0 AngleInfo("}};
    for (const auto& kind : kinds) {
        SCOPED_TRACE(kind.line);
        TestDesk desk(TwoItems());
        desk.Start();
        for (const char number : {'2', '1', '2'}) {
            EXPECT_TRUE(Perform(desk, kind.line).IsDone());
            EXPECT_EQ(desk.Take().rfind(std::string(kind.received) + number, 0), 0);
        }
    }
}

TEST(Commands, RefuseTheNextStreamIfThereIsNone)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start();

    EXPECT_EQ(Perform(desk, "audio next").Reason(),
              "no audio stream 1; there are no audio streams");
    EXPECT_EQ(Perform(desk, "subtitle next").Reason(),
              "no subtitle stream 1; there are no subtitle streams");
    EXPECT_TRUE(Perform(desk, "angle next").IsDone()) << "every play item has one";
    EXPECT_EQ(desk.Take(), "");
}

} // namespace

} // namespace deskplayer

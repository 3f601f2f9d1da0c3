#include <gtest/gtest.h>

#include <algorithm>
#include <functional>

#include "../testdesk.h"

namespace deskplayer
{

namespace
{

typedef std::function<Outcome(TestDesk&)> Operation;

bd::PlayMode Mode(bd::PlayDirectionDef direction, bd::PlaySpeedDef speed)
{
    return bd::PlayMode(direction, speed);
}

/** An item that supports every operation and ends in a still, and another one. */
PlayList Everything()
{
    return ListOf(
        {WithEndlessStill(RichItem(10)), RichItem(10)},
        {Entry(0, Ticks(0)), Entry(0, 5 * Second), Entry(1, Ticks(0)), Entry(1, 5 * Second)});
}

/** Brings a navigator that plays Everything() to a status. */
void Bring(TestDesk& desk, Status status)
{
    if (status == Status::Stopped) {
        return;
    }
    desk.Start(6 * Second);
    switch (status) {
    case Status::Paused:
        desk.Do(desk.navigator.Pause());
        break;
    case Status::Still:
        desk.navigator.Advance(10 * Second);
        break;
    case Status::Suspended:
        desk.Do(desk.navigator.Suspend());
        break;
    case Status::Standby:
        desk.Do(desk.navigator.GoToStandby());
        break;
    case Status::Finished:
        desk.Do(desk.navigator.Starve());
        break;
    case Status::Stopped:
    case Status::Playing:
        break;
    }
    desk.Take();
    ASSERT_EQ(desk.navigator.CurrentStatus(), status);
}

const std::vector<std::pair<Status, std::string>> AllStatuses = {
    {Status::Stopped, "stopped"},     {Status::Playing, "playing"},
    {Status::Paused, "paused"},       {Status::Still, "in a still"},
    {Status::Suspended, "suspended"}, {Status::Standby, "in standby"},
    {Status::Finished, "finished"}};

/** Operations that are carried out in some statuses and refused in all others. */
struct StatusRule {
    const char* name;
    Operation operation;
    std::vector<Status> statuses;
    const char* expected; ///< the statuses as the message lists them
};

typedef std::pair<const char*, Operation> NamedOperation;

/** Operations that need a picture and that no mask can forbid. */
const NamedOperation Unmaskable[] = {
    {"Suspend", [](TestDesk& d) { return d.navigator.Suspend(); }},
    {"SetPointA", [](TestDesk& d) { return d.navigator.SetPointA(); }},
    {"SetPointB", [](TestDesk& d) { return d.navigator.SetPointB(); }},
    {"EndABRepeat", [](TestDesk& d) { return d.navigator.EndABRepeat(); }},
    {"RepeatChapter", [](TestDesk& d) { return d.navigator.RepeatChapter(); }},
    {"RepeatTitle", [](TestDesk& d) { return d.navigator.RepeatTitle(); }},
    {"EndChapterTitleRepeat", [](TestDesk& d) { return d.navigator.EndChapterTitleRepeat(); }},
    {"SetTrigger", [](TestDesk& d) { return d.navigator.SetTrigger(Second); }},
    {"SelectStyle", [](TestDesk& d) { return d.navigator.SelectStyle(2); }},
    {"Zoom",
     [](TestDesk& d) {
         return d.navigator.Zoom({WholePicture, WholePicture, 0});
     }},
    {"GoToStandby", [](TestDesk& d) { return d.navigator.GoToStandby(); }},
    {"FailPreload", [](TestDesk& d) { return d.navigator.FailPreload(); }},
    {"Starve", [](TestDesk& d) { return d.navigator.Starve(); }},
};

std::vector<StatusRule> StatusRules()
{
    std::vector<StatusRule> rules = {
        {"Play",
         [](TestDesk& d) { return d.navigator.Play(); },
         {Status::Stopped, Status::Finished},
         "stopped or finished"},
        {"Pause", [](TestDesk& d) { return d.navigator.Pause(); }, {Status::Playing}, "playing"},
        {"Continue",
         [](TestDesk& d) { return d.navigator.Continue(); },
         {Status::Paused},
         "paused"},
        {"Step", [](TestDesk& d) { return d.navigator.Step(); }, {Status::Paused}, "paused"},
        {"normal speed",
         [](TestDesk& d) { return d.navigator.SetPlayMode(bd::PlayMode()); },
         {Status::Playing, Status::Paused},
         "playing or paused"},
        {"fast play",
         [](TestDesk& d) {
             return d.navigator.SetPlayMode(Mode(bd::PlayDirectionForward, bd::PlaySpeedFast1));
         },
         {Status::Playing, Status::Paused},
         "playing or paused"},
        {"backward",
         [](TestDesk& d) {
             return d.navigator.SetPlayMode(Mode(bd::PlayDirectionBackward, bd::PlaySpeedNormal));
         },
         {Status::Playing, Status::Paused},
         "playing or paused"},
        {"EndStill",
         [](TestDesk& d) { return d.navigator.EndStill(); },
         {Status::Still},
         "in a still"},
        {"Resume",
         [](TestDesk& d) { return d.navigator.Resume(); },
         {Status::Suspended},
         "suspended"},
        {"WakeUp",
         [](TestDesk& d) { return d.navigator.WakeUp(d.desk.ResumeData()); },
         {Status::Standby},
         "in standby"},
    };
    const NamedOperation maskable[] = {
        {"Stop", [](TestDesk& d) { return d.navigator.Stop(); }},
        {"SearchTime", [](TestDesk& d) { return d.navigator.SearchTime(Second); }},
        {"SearchChapter", [](TestDesk& d) { return d.navigator.SearchChapter(1); }},
        {"SkipToNextChapter", [](TestDesk& d) { return d.navigator.SkipToNextChapter(); }},
        {"SkipToPreviousChapter", [](TestDesk& d) { return d.navigator.SkipToPreviousChapter(); }},
        {"SelectAudio", [](TestDesk& d) { return d.navigator.SelectAudio(2); }},
        {"SelectSubtitle", [](TestDesk& d) { return d.navigator.SelectSubtitle(2); }},
        {"ShowSubtitles", [](TestDesk& d) { return d.navigator.ShowSubtitles(false); }},
        {"SelectAngle", [](TestDesk& d) { return d.navigator.SelectAngle(2); }},
        {"SelectSecondaryVideo", [](TestDesk& d) { return d.navigator.SelectSecondaryVideo(2); }},
        {"ShowSecondaryVideo", [](TestDesk& d) { return d.navigator.ShowSecondaryVideo(true); }},
        {"SelectSecondaryAudio", [](TestDesk& d) { return d.navigator.SelectSecondaryAudio(2); }},
        {"ShowSecondaryAudio", [](TestDesk& d) { return d.navigator.ShowSecondaryAudio(true); }},
        {"SelectPipSubtitle", [](TestDesk& d) { return d.navigator.SelectPipSubtitle(2); }},
        {"PickPipSubtitle", [](TestDesk& d) { return d.navigator.PickPipSubtitle(true); }},
        {"OpenPopUpMenu", [](TestDesk& d) { return d.navigator.OpenPopUpMenu(); }},
    };
    const auto add = [&rules](const NamedOperation& named) {
        rules.push_back({named.first,
                         named.second,
                         {Status::Playing, Status::Paused, Status::Still},
                         "playing, paused or in a still"});
    };
    std::for_each(std::begin(maskable), std::end(maskable), add);
    std::for_each(std::begin(Unmaskable), std::end(Unmaskable), add);
    return rules;
}

TEST(Refusals, NameTheRequiredStatus)
{
    for (const StatusRule& rule : StatusRules()) {
        for (const auto& [status, name] : AllStatuses) {
            SCOPED_TRACE(rule.name + (" while " + name));
            TestDesk desk(Everything());
            Bring(desk, status);
            const std::string before = desk.Snapshot();

            const Outcome outcome = rule.operation(desk);

            if (std::count(rule.statuses.begin(), rule.statuses.end(), status) != 0) {
                EXPECT_TRUE(outcome.IsDone()) << outcome.Reason();
                continue;
            }
            EXPECT_EQ(outcome.Reason(), "not " + std::string(rule.expected) + ", but " + name);
            EXPECT_EQ(desk.Take(), "");
            EXPECT_EQ(desk.Snapshot(), before);
        }
    }
}

TEST(Refusals, NameTheClosedMenu)
{
    const Operation operations[] = {
        [](TestDesk& d) { return d.navigator.ClosePopUpMenu(); },
        [](TestDesk& d) { return d.navigator.SelectPreviousButton(); },
        [](TestDesk& d) { return d.navigator.SelectNextButton(); },
        [](TestDesk& d) { return d.navigator.SelectButton(1); },
        [](TestDesk& d) { return d.navigator.ActivateButton(); },
        [](TestDesk& d) { return d.navigator.SelectAndActivateButton(1); }};
    for (const Operation& operation : operations) {
        for (const auto& [status, name] : AllStatuses) {
            SCOPED_TRACE(name);
            TestDesk desk(Everything());
            Bring(desk, status);
            const std::string before = desk.Snapshot();

            EXPECT_EQ(operation(desk).Reason(), "no menu is open");
            EXPECT_EQ(desk.Take(), "");
            EXPECT_EQ(desk.Snapshot(), before);
        }
    }
}

/** An operation that a disc can forbid, and a preparation after which nothing else refuses it. */
struct MaskRule {
    bd::UserOperationMaskDef operation;
    const char* name;
    Operation perform;
    std::function<void(TestDesk&)> prepare = [](TestDesk&) {};
};

void OpenMenu(TestDesk& desk)
{
    desk.Do(desk.navigator.OpenPopUpMenu());
}

std::vector<MaskRule> MaskRules()
{
    return {
        {bd::UserOperationChapterSearch, "ChapterSearch",
         [](TestDesk& d) { return d.navigator.SearchChapter(1); }},
        {bd::UserOperationTimeSearch, "TimeSearch",
         [](TestDesk& d) { return d.navigator.SearchTime(Ticks(0)); }},
        {bd::UserOperationSkipToNextPoint, "SkipToNextPoint",
         [](TestDesk& d) { return d.navigator.SkipToNextChapter(); }},
        {bd::UserOperationSkipBackToPreviousPoint, "SkipBackToPreviousPoint",
         [](TestDesk& d) { return d.navigator.SkipToPreviousChapter(); }},
        {bd::UserOperationStop, "Stop", [](TestDesk& d) { return d.navigator.Stop(); }},
        {bd::UserOperationPauseOn, "PauseOn", [](TestDesk& d) { return d.navigator.Pause(); }},
        {bd::UserOperationStillOff, "StillOff", [](TestDesk& d) { return d.navigator.EndStill(); },
         [](TestDesk& d) { d.navigator.Advance(20 * Second); }},
        {bd::UserOperationForwardPlay, "ForwardPlay",
         [](TestDesk& d) {
             return d.navigator.SetPlayMode(Mode(bd::PlayDirectionForward, bd::PlaySpeedFast1));
         }},
        {bd::UserOperationForwardPlay, "ForwardPlay",
         [](TestDesk& d) {
             return d.navigator.SetPlayMode(Mode(bd::PlayDirectionForward, bd::PlaySpeedSlow1));
         }},
        {bd::UserOperationBackwardPlay, "BackwardPlay",
         [](TestDesk& d) {
             return d.navigator.SetPlayMode(Mode(bd::PlayDirectionBackward, bd::PlaySpeedNormal));
         }},
        {bd::UserOperationBackwardPlay, "BackwardPlay",
         [](TestDesk& d) {
             return d.navigator.SetPlayMode(Mode(bd::PlayDirectionBackward, bd::PlaySpeedFast1));
         }},
        {bd::UserOperationResume, "Resume", [](TestDesk& d) { return d.navigator.Resume(); },
         [](TestDesk& d) { d.Do(d.navigator.Suspend()); }},
        {bd::UserOperationMoveUpSelectedButton, "MoveUpSelectedButton",
         [](TestDesk& d) { return d.navigator.SelectPreviousButton(); }, OpenMenu},
        {bd::UserOperationMoveDownSelectedButton, "MoveDownSelectedButton",
         [](TestDesk& d) { return d.navigator.SelectNextButton(); }, OpenMenu},
        {bd::UserOperationSelectButton, "SelectButton",
         [](TestDesk& d) { return d.navigator.SelectButton(1); }, OpenMenu},
        {bd::UserOperationActivateButton, "ActivateButton",
         [](TestDesk& d) { return d.navigator.ActivateButton(); }, OpenMenu},
        {bd::UserOperationSelectButtonAndActivate, "SelectButtonAndActivate",
         [](TestDesk& d) { return d.navigator.SelectAndActivateButton(1); }, OpenMenu},
        {bd::UserOperationPrimaryAudioStreamNumberChange, "PrimaryAudioStreamNumberChange",
         [](TestDesk& d) { return d.navigator.SelectAudio(2); }},
        {bd::UserOperationAngleNumberChange, "AngleNumberChange",
         [](TestDesk& d) { return d.navigator.SelectAngle(2); }},
        {bd::UserOperationPopupOn, "PopupOn",
         [](TestDesk& d) { return d.navigator.OpenPopUpMenu(); }},
        {bd::UserOperationPopupOff, "PopupOff",
         [](TestDesk& d) { return d.navigator.ClosePopUpMenu(); }, OpenMenu},
        {bd::UserOperationPGTextSTEnableDisable, "PGTextSTEnableDisable",
         [](TestDesk& d) { return d.navigator.ShowSubtitles(false); }},
        {bd::UserOperationPGTextSTStreamNumberChange, "PGTextSTStreamNumberChange",
         [](TestDesk& d) { return d.navigator.SelectSubtitle(2); }},
        {bd::UserOperationSecondaryVideoEnableDisable, "SecondaryVideoEnableDisable",
         [](TestDesk& d) { return d.navigator.ShowSecondaryVideo(true); }},
        {bd::UserOperationSecondaryVideoStreamNumberChange, "SecondaryVideoStreamNumberChange",
         [](TestDesk& d) { return d.navigator.SelectSecondaryVideo(2); }},
        {bd::UserOperationSecondaryAudioEnableDisable, "SecondaryAudioEnableDisable",
         [](TestDesk& d) { return d.navigator.ShowSecondaryAudio(true); }},
        {bd::UserOperationSecondaryAudioStreamNumberChange, "SecondaryAudioStreamNumberChange",
         [](TestDesk& d) { return d.navigator.SelectSecondaryAudio(2); }},
        {bd::UserOperationPiPPGTextSTStreamNumberChange, "PiPPGTextSTStreamNumberChange",
         [](TestDesk& d) { return d.navigator.SelectPipSubtitle(2); }},
        {bd::UserOperationPiPPGTextSTStreamNumberChange, "PiPPGTextSTStreamNumberChange",
         [](TestDesk& d) { return d.navigator.PickPipSubtitle(true); }},
    };
}

/** Plays Everything() to its second chapter, with operations forbidden by item 0 or the play list.
 */
std::unique_ptr<TestDesk> DeskForbidding(std::uint64_t byPlayList, std::uint64_t byItem)
{
    PlayList playList = Everything();
    playList.applicationInfo.uoMask = byPlayList;
    playList.playItems.front().uoMask = byItem;
    auto desk = std::make_unique<TestDesk>(playList);
    desk->Start(6 * Second);
    return desk;
}

TEST(Refusals, NameThePlayListOrItemThatForbidsAnOperation)
{
    for (const MaskRule& rule : MaskRules()) {
        SCOPED_TRACE(rule.name);
        const std::uint64_t mask = MaskOf({rule.operation});
        const struct {
            std::uint64_t byPlayList;
            std::uint64_t byItem;
            const char* who;
        } cases[] = {{mask, 0, "play list 7"},
                     {0, mask, "play item 0"},
                     {mask, mask, "play list 7 and its play item 0"}};
        for (const auto& forbidding : cases) {
            const auto desk = DeskForbidding(forbidding.byPlayList, forbidding.byItem);
            rule.prepare(*desk);
            desk->Take();
            const std::string before = desk->Snapshot();

            EXPECT_EQ(rule.perform(*desk).Reason(),
                      rule.name + (" is forbidden by " + std::string(forbidding.who)));
            EXPECT_EQ(desk->Take(), "");
            EXPECT_EQ(desk->Snapshot(), before);
        }
    }
}

TEST(Refusals, DependOnlyOnTheBitOfTheOperation)
{
    for (const MaskRule& rule : MaskRules()) {
        SCOPED_TRACE(rule.name);
        std::uint64_t others = ~MaskOf({rule.operation});
        if (rule.operation != bd::UserOperationPopupOn) {
            others &= ~MaskOf({bd::UserOperationPopupOn}); // needed by the preparation
        }
        const auto desk = DeskForbidding(others, others);
        rule.prepare(*desk);

        const Outcome outcome = rule.perform(*desk);

        EXPECT_TRUE(outcome.IsDone()) << outcome.Reason();
    }
}

TEST(Refusals, NameTheMaskBeforeOtherReasons)
{
    const auto desk = DeskForbidding(~std::uint64_t{0}, 0);

    EXPECT_EQ(desk->navigator.SelectAudio(99).Reason(),
              "PrimaryAudioStreamNumberChange is forbidden by play list 7");
    EXPECT_EQ(desk->navigator.EndStill().Reason(), "StillOff is forbidden by play list 7");
    EXPECT_EQ(desk->navigator.ClosePopUpMenu().Reason(), "PopupOff is forbidden by play list 7");
}

TEST(Refusals, NameTheActiveItem)
{
    TestDesk desk(ListOf({Item(1), Forbidding(Item(1), {bd::UserOperationStop})}));
    desk.Start(Second);

    EXPECT_EQ(desk.navigator.Stop().Reason(), "Stop is forbidden by play item 1");
}

TEST(Refusals, IgnoreTheMaskOnceNothingPlays)
{
    for (const Status status : {Status::Stopped, Status::Standby, Status::Finished}) {
        PlayList playList = Everything();
        playList.applicationInfo.uoMask = MaskOf({bd::UserOperationTimeSearch});
        TestDesk desk(playList);
        Bring(desk, status);
        EXPECT_EQ(desk.navigator.SearchTime(Ticks(0)).Reason().rfind("not playing, ", 0), 0);
    }
}

TEST(Refusals, ExcludeOperationsThatNoMaskCanForbid)
{
    std::vector<NamedOperation> operations(std::begin(Unmaskable), std::end(Unmaskable));
    operations.emplace_back("normal speed",
                            [](TestDesk& d) { return d.navigator.SetPlayMode(bd::PlayMode()); });
    for (const auto& [name, operation] : operations) {
        SCOPED_TRACE(name);
        const auto desk = DeskForbidding(~std::uint64_t{0}, ~std::uint64_t{0});
        const Outcome outcome = operation(*desk);
        EXPECT_TRUE(outcome.IsDone()) << outcome.Reason();
    }
}

TEST(Refusals, ExcludeContinueAndStep)
{
    PlayList playList = ListOf({Item(10), Item(10)});
    playList.playItems.back().uoMask = ~std::uint64_t{0};
    TestDesk desk(playList);
    desk.Start();
    desk.Do(desk.navigator.Pause());
    desk.Do(desk.navigator.SearchTime(11 * Second));

    EXPECT_TRUE(desk.navigator.Step().IsDone());
    EXPECT_TRUE(desk.navigator.Continue().IsDone());
}

} // namespace

} // namespace deskplayer

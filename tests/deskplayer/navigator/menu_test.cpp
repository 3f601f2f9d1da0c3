#include <gtest/gtest.h>

#include "../testdesk.h"
#include "navigator/buttonprogram.h"

namespace deskplayer
{

namespace
{

/** A rich item with chapters at 0, 3 and 6 seconds, followed by an item without a menu. */
PlayList ThreeChapters()
{
    return ListOf({RichItem(10), Item(10)}, {Entry(0, Ticks(0)), Link(0, Second),
                                             Entry(0, 3 * Second), Entry(0, 6 * Second)});
}

/** The callbacks of a button that plays the chapter at @p position from @p mark. */
std::string Activation(int ticket, int button)
{
    return "1 ButtonActivationBusy()\n"
           "1 ExecuteButton(" +
           std::to_string(ticket) + ", " + std::to_string(button) +
           ", program shared by 2)\n"
           "1 ButtonActivationDone()\n"
           "1 InteractiveGraphicsInvisible()\n"
           "1 InteractiveGraphicsInactive()\n"
           "1 JumpOccurred()\n";
}

/** Records the programs of buttons. */
class ProgramRecorder : public bdmv::NavigatorListenerAdapter
{
public:
    void ExecuteButton(bd::UInt32 /*ticket*/, bd::ButtonId /*buttonId*/,
                       bdmv::IProgramData::RefPtr& program) override
    {
        kept = program;
    }

    bdmv::IProgramData::RefPtr kept;
};

TEST(Menu, IsOpenedAndClosed)
{
    TestDesk desk(ThreeChapters());
    desk.Start(Second);

    EXPECT_TRUE(desk.navigator.OpenPopUpMenu().IsDone());
    EXPECT_EQ(desk.Take(), "1 InteractiveGraphicsActive()\n"
                           "1 InteractiveGraphicsVisible()\n");
    EXPECT_TRUE(desk.navigator.ClosePopUpMenu().IsDone());
    EXPECT_EQ(desk.Take(), "1 InteractiveGraphicsInvisible()\n"
                           "1 InteractiveGraphicsInactive()\n");
    EXPECT_TRUE(desk.navigator.OpenPopUpMenu().IsDone());
}

TEST(Menu, IsRefusedIfAlreadyOpenOrMissing)
{
    TestDesk desk(ThreeChapters());
    desk.Start();
    desk.Do(desk.navigator.OpenPopUpMenu());
    EXPECT_EQ(desk.navigator.OpenPopUpMenu().Reason(), "the menu is already open");

    desk.Do(desk.navigator.SearchTime(11 * Second));
    EXPECT_EQ(desk.navigator.OpenPopUpMenu().Reason(), "the play item has no menu");
    EXPECT_EQ(desk.Take(), "");
}

TEST(Menu, IsClosedByAnItemWithoutAMenu)
{
    TestDesk desk(ThreeChapters());
    desk.Start();
    desk.Do(desk.navigator.OpenPopUpMenu());

    desk.navigator.Advance(10 * Second);

    const std::string received = desk.Take();
    EXPECT_NE(received.find("10 InteractiveGraphicsInvisible()\n"
                            "10 InteractiveGraphicsInactive()\n"
                            "10 PopUpMenuUnavailable()\n"),
              std::string::npos)
        << received;
    EXPECT_EQ(desk.navigator.ClosePopUpMenu().Reason(), "no menu is open");
}

TEST(Menu, StaysOpenIfTheNextItemHasAMenu)
{
    TestDesk desk(ListOf({RichItem(1), RichItem(1)}));
    desk.Start();
    desk.Do(desk.navigator.OpenPopUpMenu());

    desk.navigator.Advance(Second);

    EXPECT_EQ(desk.TakeWithoutPositions(),
              "1 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n");
    EXPECT_TRUE(desk.navigator.ClosePopUpMenu().IsDone());
}

TEST(Menu, IsClosedByStop)
{
    TestDesk desk(ThreeChapters());
    desk.Start(Second);
    desk.Do(desk.navigator.OpenPopUpMenu());

    desk.navigator.Stop();

    EXPECT_EQ(desk.Take(), "1 InteractiveGraphicsInvisible()\n"
                           "1 InteractiveGraphicsInactive()\n"
                           "1 Stopped()\n");
}

TEST(Menu, ActivatesTheButtonOfTheCurrentChapter)
{
    TestDesk desk(ThreeChapters());
    desk.Start();
    desk.Do(desk.navigator.SearchTime(4 * Second));
    desk.navigator.Advance(Second);
    desk.Do(desk.navigator.OpenPopUpMenu());

    EXPECT_TRUE(desk.navigator.ActivateButton().IsDone());

    EXPECT_EQ(desk.Take(), Activation(1, 2) + "1 MarkInfo(7, 2, 135000)\n"
                                              "1 CurrentTimePosition(135000)\n");
    EXPECT_EQ(desk.navigator.ActivateButton().Reason(), "no menu is open");
}

TEST(Menu, MovesBetweenButtonsWithoutCallbacks)
{
    TestDesk desk(ThreeChapters());
    desk.Start(Second);
    desk.Do(desk.navigator.OpenPopUpMenu());

    EXPECT_EQ(desk.navigator.SelectPreviousButton().Reason(),
              "no button 0; buttons are numbered 1 to 3");
    EXPECT_TRUE(desk.navigator.SelectNextButton().IsDone());
    EXPECT_TRUE(desk.navigator.SelectNextButton().IsDone());
    EXPECT_EQ(desk.navigator.SelectNextButton().Reason(),
              "no button 4; buttons are numbered 1 to 3");
    EXPECT_TRUE(desk.navigator.SelectPreviousButton().IsDone());
    EXPECT_EQ(desk.Take(), "");

    desk.navigator.ActivateButton();
    EXPECT_EQ(desk.Take(), Activation(1, 2) + "1 MarkInfo(7, 2, 135000)\n"
                                              "1 ChapterNumber(2)\n"
                                              "1 CurrentTimePosition(135000)\n");
}

TEST(Menu, SelectsAButtonByItsNumber)
{
    TestDesk desk(ThreeChapters());
    desk.Start(Second);
    desk.Do(desk.navigator.OpenPopUpMenu());

    EXPECT_TRUE(desk.navigator.SelectButton(3).IsDone());
    EXPECT_EQ(desk.navigator.SelectButton(0).Reason(), "no button 0; buttons are numbered 1 to 3");
    EXPECT_EQ(desk.navigator.SelectButton(65539).Reason(),
              "no button 65539; buttons are numbered 1 to 3");
    EXPECT_EQ(desk.Take(), "");

    desk.Do(desk.navigator.ActivateButton());
    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), 6 * Second);
}

TEST(Menu, SelectsAButtonAndActivatesIt)
{
    TestDesk desk(ThreeChapters());
    desk.Start(Second);
    desk.Do(desk.navigator.OpenPopUpMenu());
    EXPECT_EQ(desk.navigator.SelectAndActivateButton(4).Reason(),
              "no button 4; buttons are numbered 1 to 3");

    EXPECT_TRUE(desk.navigator.SelectAndActivateButton(3).IsDone());

    EXPECT_EQ(desk.Take(), Activation(1, 3) + "1 MarkInfo(7, 3, 270000)\n"
                                              "1 ChapterNumber(3)\n"
                                              "1 CurrentTimePosition(270000)\n");
}

TEST(Menu, GivesEveryActivationItsOwnTicket)
{
    TestDesk desk(ThreeChapters());
    desk.Start(Second);
    for (int ticket = 1; ticket <= 3; ++ticket) {
        desk.Do(desk.navigator.OpenPopUpMenu());
        desk.navigator.SelectAndActivateButton(1);
        EXPECT_EQ(desk.Take().rfind(Activation(ticket, 1), 0), 0);
    }
}

TEST(Menu, PassesOnAProgramThatClosesTheMenuAndPlaysTheMarkOfTheChapter)
{
    TestDesk desk(ListOf({RichItem(10)}, {Entry(0, Ticks(0)), Link(0, Ticks(1)), Link(0, Ticks(2)),
                                          Entry(0, 3 * Second)}));
    ProgramRecorder keeper;
    desk.desk.Listeners().AddListener(&keeper);
    desk.Start();
    desk.Do(desk.navigator.OpenPopUpMenu());
    desk.Do(desk.navigator.SelectAndActivateButton(2));

    ASSERT_TRUE(keeper.kept);
    EXPECT_EQ(keeper.kept.GetCount(), 1) << "the navigator keeps no program";
    ASSERT_EQ(keeper.kept->GetNumberOfNavigationCommands(), 2);
    EXPECT_EQ(keeper.kept->GetNavigationCommandData(0)->GetCommand(),
              bdmv::INavigationCommandData::CommandPopupMenuOff);
    const bdmv::INavigationCommandData* const play = keeper.kept->GetNavigationCommandData(1);
    EXPECT_EQ(play->GetCommand(), bdmv::INavigationCommandData::CommandPlayPLatMK);
    bool isImmediate1 = false;
    bool isImmediate2 = false;
    bd::UInt32 playList = 0;
    bd::UInt32 mark = 0;
    play->GetOperands(isImmediate1, playList, isImmediate2, mark);
    EXPECT_TRUE(isImmediate1);
    EXPECT_EQ(playList, 7);
    EXPECT_TRUE(isImmediate2);
    EXPECT_EQ(mark, 3);
    desk.desk.Listeners().RemoveListener(&keeper);
}

TEST(Menu, SelectsTheFirstButtonBeforeTheFirstChapter)
{
    TestDesk desk(ListOf({RichItem(10)}, {Entry(0, 3 * Second), Entry(0, 6 * Second)}));
    desk.Start();
    desk.Do(desk.navigator.OpenPopUpMenu());

    desk.Do(desk.navigator.ActivateButton());

    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), 3 * Second);
}

TEST(Menu, NumbersItsButtonsWithoutGapsEvenIfChapterNumbersHaveGaps)
{
    // The first mark has no position, so the chapters are numbered 2 and 3.
    TestDesk desk(
        ListOf({RichItem(10)}, {Entry(9, Ticks(0)), Entry(0, Ticks(0)), Entry(0, 6 * Second)}));
    desk.Start();
    desk.Do(desk.navigator.SearchTime(7 * Second));
    EXPECT_EQ(desk.navigator.Context().GetCurrentChapter(), 3);
    desk.Do(desk.navigator.OpenPopUpMenu());

    desk.Do(desk.navigator.ActivateButton());

    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), 6 * Second);
}

TEST(Menu, HasNoButtonsWithoutChapters)
{
    TestDesk desk(ListOf({RichItem(10)}));
    desk.Start();
    desk.Do(desk.navigator.OpenPopUpMenu());

    EXPECT_EQ(desk.navigator.ActivateButton().Reason(), "no button 1; there are no buttons");
    EXPECT_EQ(desk.navigator.SelectNextButton().Reason(), "no button 2; there are no buttons");
    EXPECT_EQ(desk.Take(), "");
}

TEST(Menu, RefusesOperationsWhilePlaybackIsSuspended)
{
    TestDesk desk(ThreeChapters());
    desk.Start();
    desk.Do(desk.navigator.OpenPopUpMenu());
    desk.Do(desk.navigator.Suspend());
    const std::string suspended = "not playing, paused or in a still, but suspended";

    EXPECT_EQ(desk.navigator.ClosePopUpMenu().Reason(), suspended);
    EXPECT_EQ(desk.navigator.SelectPreviousButton().Reason(), suspended);
    EXPECT_EQ(desk.navigator.SelectNextButton().Reason(), suspended);
    EXPECT_EQ(desk.navigator.SelectButton(1).Reason(), suspended);
    EXPECT_EQ(desk.navigator.ActivateButton().Reason(), suspended);
    EXPECT_EQ(desk.navigator.SelectAndActivateButton(1).Reason(), suspended);
    EXPECT_EQ(desk.Take(), "");

    desk.Do(desk.navigator.Resume());
    EXPECT_TRUE(desk.navigator.ClosePopUpMenu().IsDone());
}

TEST(ButtonProgram, HasNoCommandAfterItsLast)
{
    const ButtonProgram program({ButtonCommand(bdmv::INavigationCommandData::CommandNop)});

    EXPECT_EQ(program.GetNumberOfNavigationCommands(), 1);
    EXPECT_NE(program.GetNavigationCommandData(0), nullptr);
    EXPECT_EQ(program.GetNavigationCommandData(1), nullptr);
    EXPECT_EQ(program.GetNavigationCommandData(65535), nullptr);
}

TEST(ButtonProgram, CanBeEmpty)
{
    const ButtonProgram program({});

    EXPECT_EQ(program.GetNumberOfNavigationCommands(), 0);
    EXPECT_EQ(program.GetNavigationCommandData(0), nullptr);
}

TEST(ButtonCommand, HasZeroForOmittedOperands)
{
    const ButtonCommand command(bdmv::INavigationCommandData::CommandStillOff);
    bool isImmediate1 = false;
    bool isImmediate2 = false;
    bd::UInt32 operand1 = 1;
    bd::UInt32 operand2 = 1;

    command.GetOperands(isImmediate1, operand1, isImmediate2, operand2);

    EXPECT_EQ(command.GetCommand(), bdmv::INavigationCommandData::CommandStillOff);
    EXPECT_TRUE(isImmediate1 && isImmediate2);
    EXPECT_EQ(operand1, 0);
    EXPECT_EQ(operand2, 0);
}

} // namespace

} // namespace deskplayer

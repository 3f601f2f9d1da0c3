#include <system_error>

#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "eventtest.h"

namespace
{

typedef bdmv::IPlaybackContext::RefPtr ProgramPtr;

/** A program without commands that reports its destruction. */
class Program : public bdmv::IProgramData
{
public:
    explicit Program(std::function<void()> onDestruction = [] {})
        : m_OnDestruction(std::move(onDestruction))
    {
    }

    ~Program() override { m_OnDestruction(); }
    bd::UInt16 GetNumberOfNavigationCommands() const override { return 0; }
    const bdmv::INavigationCommandData* GetNavigationCommandData(CommandIdDef) const override
    {
        return nullptr;
    }

private:
    std::function<void()> m_OnDestruction;
};

void HasAButtonPending(Context& context)
{
    context.executeButtonProgram = ProgramPtr(new Program);
    context.executeButtonTicket = 0xFFFFFFFF;
    context.executeButtonId = 65535;
}

const Scenario interactiveGraphicsScenarios[] = {
    Notification<bdmv::InteractiveGraphicsVisibleEvent>("Sending InteractiveGraphicsVisible",
                                                        "InteractiveGraphicsVisible()"),
    Notification<bdmv::InteractiveGraphicsInvisibleEvent>("Sending InteractiveGraphicsInvisible",
                                                          "InteractiveGraphicsInvisible()"),
    Notification<bdmv::InteractiveGraphicsActiveEvent>("Sending InteractiveGraphicsActive",
                                                       "InteractiveGraphicsActive()"),
    Notification<bdmv::InteractiveGraphicsInactiveEvent>("Sending InteractiveGraphicsInactive",
                                                         "InteractiveGraphicsInactive()"),
    Notification<bdmv::PopUpMenuAvailableEvent>("Sending PopUpMenuAvailable",
                                                "PopUpMenuAvailable()"),
    Notification<bdmv::PopUpMenuUnavailableEvent>("Sending PopUpMenuUnavailable",
                                                  "PopUpMenuUnavailable()"),
    Notification<bdmv::ButtonActivationBusyEvent>("Sending ButtonActivationBusy",
                                                  "ButtonActivationBusy()"),
    Notification<bdmv::ButtonActivationDoneEvent>("Sending ButtonActivationDone",
                                                  "ButtonActivationDone()"),

    {"ExecuteButton", New<bdmv::ExecuteButtonEvent>(), HasAButtonPending,
     Queried("GetExecuteButtonData(no program, 0, 0) -> program shared by 2, 4294967295, 65535") +
         Logged("Sending ExecuteButton - ticket: 4294967295, buttonId: 65535") +
         Fired("ExecuteButton(4294967295, 65535, program shared by 2)")},
    {"ExecuteButtonWithoutProgram", New<bdmv::ExecuteButtonEvent>(),
     [](Context& context) {
         context.executeButtonTicket = 7;
         context.executeButtonId = 3;
     },
     Queried("GetExecuteButtonData(no program, 0, 0) -> no program, 7, 3") +
         Logged("Sending ExecuteButton - ticket: 7, buttonId: 3") +
         Fired("ExecuteButton(7, 3, no program)")},
    {"ExecuteButtonUntouched", New<bdmv::ExecuteButtonEvent>(),
     [](Context& context) {
         HasAButtonPending(context);
         context.untouched = {"GetExecuteButtonData"};
     },
     Queried("GetExecuteButtonData(no program, 0, 0) -> untouched") +
         Logged("Sending ExecuteButton - ticket: 0, buttonId: 0") +
         Fired("ExecuteButton(0, 0, no program)")},
};

INSTANTIATE_TEST_SUITE_P(InteractiveGraphics, EventScenario,
                         testing::ValuesIn(interactiveGraphicsScenarios), EventScenario::Name);

class ButtonExecution : public EventTest
{
protected:
    /** Runs an action of the test with the program that it receives. */
    struct ProgramListener : bdmv::NavigatorListenerAdapter {
        void ExecuteButton(bd::UInt32, bd::ButtonId, ProgramPtr& program) override
        {
            onProgram(program);
        }
        std::function<void(ProgramPtr&)> onProgram;
    };

    ButtonExecution()
    {
        HoldAProgram([this] { journal.Add("gone"); });
    }

    void HoldAProgram(std::function<void()> onDestruction)
    {
        context.executeButtonProgram = ProgramPtr(new Program(std::move(onDestruction)));
        journal.Take();
    }

    /** Puts a listener between A and B. */
    void AddAfterA(ProgramListener& listener)
    {
        listeners.RemoveListener(&b);
        listeners.RemoveListener(&c);
        listeners.AddListener(&listener);
        listeners.AddListener(&b);
        listeners.AddListener(&c);
    }

    const std::string m_QueriedAndLogged =
        Queried("GetExecuteButtonData(no program, 0, 0) -> program shared by 2, 0, 0") +
        Logged("Sending ExecuteButton - ticket: 0, buttonId: 0");
};

TEST_F(ButtonExecution, TakesOneReferenceAndReleasesItAfterTheLastListener)
{
    platform.RecordAtomicAdds();

    EXPECT_EQ(Dispatch<bdmv::ExecuteButtonEvent>(),
              "atomic add 1 -> 2\n" + m_QueriedAndLogged +
                  Fired("ExecuteButton(0, 0, program shared by 2)") + "atomic add -1 -> 1\n");
}

TEST_F(ButtonExecution, TakesNoReferenceWhenTheContextWritesNoProgram)
{
    platform.RecordAtomicAdds();
    context.untouched = {"GetExecuteButtonData"};

    EXPECT_EQ(Dispatch<bdmv::ExecuteButtonEvent>(),
              Queried("GetExecuteButtonData(no program, 0, 0) -> untouched") +
                  Logged("Sending ExecuteButton - ticket: 0, buttonId: 0") +
                  Fired("ExecuteButton(0, 0, no program)"));
}

TEST_F(ButtonExecution, ReleasesTheProgramWithoutListeners)
{
    Listeners empty;
    platform.RecordAtomicAdds();

    bdmv::ExecuteButtonEvent(context).Dispatch(empty);

    EXPECT_EQ(journal.Take(), "atomic add 1 -> 2\n" + m_QueriedAndLogged + "atomic add -1 -> 1\n");
}

TEST_F(ButtonExecution, ReleasesTheProgramWhenAListenerThrows)
{
    struct Failure {
    };
    platform.RecordAtomicAdds();
    b.onCallback = [](const std::string&) { throw Failure(); };

    EXPECT_THROW(Dispatch<bdmv::ExecuteButtonEvent>(), Failure);

    EXPECT_EQ(journal.Take(), "atomic add 1 -> 2\n" + m_QueriedAndLogged +
                                  "A.ExecuteButton(0, 0, program shared by 2)\n"
                                  "B.ExecuteButton(0, 0, program shared by 2)\n"
                                  "atomic add -1 -> 1\n");
}

TEST_F(ButtonExecution, DestroysTheProgramAtTheEndWhenTheContextReleasesIt)
{
    a.onCallback = [this](const std::string&) { context.executeButtonProgram.Release(); };

    EXPECT_EQ(Dispatch<bdmv::ExecuteButtonEvent>(),
              m_QueriedAndLogged + "A.ExecuteButton(0, 0, program shared by 2)\n"
                                   "B.ExecuteButton(0, 0, program shared by 1)\n"
                                   "C.ExecuteButton(0, 0, program shared by 1)\n"
                                   "gone\n");
}

TEST_F(ButtonExecution, LeavesTheProgramToAListenerThatCopiesTheHandle)
{
    ProgramListener keeper;
    ProgramPtr kept;
    keeper.onProgram = [&](ProgramPtr& program) {
        kept = program;
        context.executeButtonProgram.Release();
    };
    AddAfterA(keeper);

    EXPECT_EQ(Dispatch<bdmv::ExecuteButtonEvent>(),
              m_QueriedAndLogged + Fired("ExecuteButton(0, 0, program shared by 2)"));
    EXPECT_TRUE(kept.IsUnique());

    kept.Release();
    EXPECT_EQ(journal.Take(), "gone\n");
}

TEST_F(ButtonExecution, ShowsLaterListenersThatTheHandleWasReset)
{
    ProgramListener resetter;
    resetter.onProgram = [](ProgramPtr& program) { program.Release(); };
    AddAfterA(resetter);

    EXPECT_EQ(Dispatch<bdmv::ExecuteButtonEvent>(), m_QueriedAndLogged +
                                                        "A.ExecuteButton(0, 0, program shared by "
                                                        "2)\n"
                                                        "B.ExecuteButton(0, 0, no program)\n"
                                                        "C.ExecuteButton(0, 0, no program)\n");
    EXPECT_TRUE(context.executeButtonProgram.IsUnique());
}

TEST_F(ButtonExecution, ReleasesTheProgramThatAListenerAssigned)
{
    ProgramListener replacer;
    replacer.onProgram = [this](ProgramPtr& program) {
        program = ProgramPtr(new Program([this] { journal.Add("replacement destroyed"); }));
    };
    AddAfterA(replacer);

    EXPECT_EQ(Dispatch<bdmv::ExecuteButtonEvent>(),
              m_QueriedAndLogged + "A.ExecuteButton(0, 0, program shared by 2)\n"
                                   "B.ExecuteButton(0, 0, program shared by 1)\n"
                                   "C.ExecuteButton(0, 0, program shared by 1)\n"
                                   "replacement destroyed\n");
    EXPECT_TRUE(context.executeButtonProgram.IsUnique());
}

TEST_F(ButtonExecution, LetsTheProgramUseTheListInItsDestructor)
{
    HoldAProgram([this] {
        listeners.RemoveListener(&b);
        bdmv::ButtonActivationDoneEvent(context).Dispatch(listeners);
    });
    a.onCallback = [this](const std::string&) { context.executeButtonProgram.Release(); };

    EXPECT_EQ(Dispatch<bdmv::ExecuteButtonEvent>(),
              m_QueriedAndLogged +
                  "A.ExecuteButton(0, 0, program shared by 2)\n"
                  "B.ExecuteButton(0, 0, program shared by 1)\n"
                  "C.ExecuteButton(0, 0, program shared by 1)\n" +
                  Logged("Sending ButtonActivationDone") +
                  "A.ButtonActivationDone()\nC.ButtonActivationDone()\n");
}

TEST_F(ButtonExecution, RefusesTheListToAProgramDestroyedInsideACallback)
{
    HoldAProgram([this] {
        EXPECT_THROW(listeners.RemoveListener(&a), std::system_error);
        journal.Add("gone");
    });
    ProgramListener resetter;
    resetter.onProgram = [this](ProgramPtr& program) {
        context.executeButtonProgram.Release();
        program.Release();
    };
    AddAfterA(resetter);

    EXPECT_EQ(Dispatch<bdmv::ExecuteButtonEvent>(), m_QueriedAndLogged +
                                                        "A.ExecuteButton(0, 0, program shared by "
                                                        "2)\n"
                                                        "gone\n"
                                                        "B.ExecuteButton(0, 0, no program)\n"
                                                        "C.ExecuteButton(0, 0, no program)\n");
}

} // namespace

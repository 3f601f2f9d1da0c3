#include <vector>

#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "eventtest.h"

namespace
{

bd::UInt8 resumeData[] = {1, 2, 3};

const Scenario systemSuspendScenarios[] = {
    {"SystemSuspended", New<bdmv::SystemSuspendedEvent>(),
     [](Context& context) {
         context.systemResumeData = {resumeData, 3};
     },
     Queried("GetSystemResumeData() -> (bytes 1 2 3, 3)") +
         Logged("Sending SystemSuspended - dataSize: 3") +
         Fired("SystemSuspended(bytes 1 2 3, 3)") + Queried("CleanupSystemResumeData()")},
    {"SystemSuspendedWithNoBytes", New<bdmv::SystemSuspendedEvent>(),
     [](Context& context) {
         context.systemResumeData = {resumeData, 0};
     },
     Queried("GetSystemResumeData() -> (bytes, 0)") +
         Logged("Sending SystemSuspended - dataSize: 0") + Fired("SystemSuspended(bytes, 0)") +
         Queried("CleanupSystemResumeData()")},
    {"SystemSuspendedWithNoData", New<bdmv::SystemSuspendedEvent>(),
     [](Context& context) {
         context.systemResumeData = {nullptr, 0xFFFFFFFF};
     },
     Queried("GetSystemResumeData() -> (null, 4294967295)") +
         Logged("Sending SystemSuspended - dataSize: 4294967295") +
         Fired("SystemSuspended(null, 4294967295)") + Queried("CleanupSystemResumeData()")},

    {"SystemResumedPlaying", New<bdmv::SystemResumedEvent>(),
     [](Context& context) { context.playingAfterSystemResume = true; },
     Queried("IsPlayingAfterSystemResume() -> true") +
         Logged("Sending SystemResumed - playing: TRUE") + Fired("SystemResumed(true)") +
         Queried("CleanupSystemResumeData()")},
    {"SystemResumedNotPlaying", New<bdmv::SystemResumedEvent>(), [](Context&) {},
     Queried("IsPlayingAfterSystemResume() -> false") +
         Logged("Sending SystemResumed - playing: FALSE") + Fired("SystemResumed(false)") +
         Queried("CleanupSystemResumeData()")},

    {"SystemResumeFailed", New<bdmv::SystemResumeFailedEvent>(), [](Context&) {},
     Logged("Sending SystemResumeFailed") + Fired("SystemResumeFailed()") +
         Queried("CleanupSystemResumeData()")},
};

INSTANTIATE_TEST_SUITE_P(SystemSuspend, EventScenario, testing::ValuesIn(systemSuspendScenarios),
                         EventScenario::Name);

class SystemSuspension : public EventTest
{
protected:
    bd::UInt8 m_First[2] = {1, 2};
    bd::UInt8 m_Second[1] = {9};
};

TEST_F(SystemSuspension, LogsTheSizeInTheDescriptorAfterTheSwitchCheck)
{
    context.systemResumeData = {m_First, 2};
    WhenTheLogSwitchIsAsked(1, [this] { context.systemResumeData = {m_Second, 1}; });

    EXPECT_EQ(Dispatch<bdmv::SystemSuspendedEvent>(),
              Queried("GetSystemResumeData() -> (bytes 1 2, 2)") +
                  Logged("Sending SystemSuspended - dataSize: 1") +
                  Fired("SystemSuspended(bytes 9, 1)") + Queried("CleanupSystemResumeData()"));
}

TEST_F(SystemSuspension, FiresTheValuesInTheDescriptorAfterTheLogCheck)
{
    context.systemResumeData = {m_First, 2};
    WhenTheLogSwitchIsAsked(0, [this] { context.systemResumeData = {m_Second, 1}; });

    EXPECT_EQ(Dispatch<bdmv::SystemSuspendedEvent>(),
              Queried("GetSystemResumeData() -> (bytes 1 2, 2)") + NotLogged() +
                  Fired("SystemSuspended(bytes 9, 1)") + Queried("CleanupSystemResumeData()"));
}

TEST_F(SystemSuspension, PassesEveryListenerTheSameValuesWhenOneChangesTheDescriptor)
{
    context.systemResumeData = {m_First, 2};
    a.onCallback = [this](const std::string&) { context.systemResumeData = {m_Second, 1}; };

    EXPECT_EQ(Dispatch<bdmv::SystemSuspendedEvent>(),
              Queried("GetSystemResumeData() -> (bytes 1 2, 2)") +
                  Logged("Sending SystemSuspended - dataSize: 2") +
                  Fired("SystemSuspended(bytes 1 2, 2)") + Queried("CleanupSystemResumeData()"));
}

TEST_F(SystemSuspension, PassesEveryListenerTheContextsOwnBlock)
{
    struct Keeper : bdmv::NavigatorListenerAdapter {
        void SystemSuspended(const void* data, bd::UInt32 size) override
        {
            blocks.emplace_back(data, size);
        }
        std::vector<std::pair<const void*, bd::UInt32>> blocks;
    } first, second;
    Listeners keepers;
    keepers.AddListener(&first);
    keepers.AddListener(&second);
    context.systemResumeData = {m_First, 2};

    bdmv::SystemSuspendedEvent(context).Dispatch(keepers);

    const std::vector<std::pair<const void*, bd::UInt32>> block = {{m_First, 2}};
    EXPECT_EQ(first.blocks, block);
    EXPECT_EQ(second.blocks, block);
}

} // namespace

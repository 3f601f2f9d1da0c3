// Dumps at awkward moments: while new callbacks arrive, inside callbacks, inside Assert(), and
// inside the functions that the box itself calls.

#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <thread>
#include <vector>

#include "bd/mutexwatch.h"
#include "bdmvnavigator/navigatorevent.h"
#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "boxtest.h"
#include "kevro/kevro_osa.h"
#include "testkit/fakeplatform.h"
#include "testkit/scriptableplaybackcontext.h"

namespace bdmvtest
{
namespace
{

class BlackBoxDump : public BoxTest
{
protected:
    /** A dump in which @p interrupt is called when the first piece has been written. */
    std::string DumpInterruptedBy(const std::function<void()>& interrupt)
    {
        return DumpInterruptedBy(box, interrupt);
    }

    static std::string DumpInterruptedBy(const bdmv::BlackBox& dumped,
                                         const std::function<void()>& interrupt)
    {
        struct Sink {
            std::string text;
            std::function<void()> interrupt;

            static void Write(void* user, const char* bytes, std::size_t size)
            {
                Sink& self = *static_cast<Sink*>(user);
                self.text.append(bytes, size);
                if (self.interrupt) {
                    const std::function<void()> once = std::move(self.interrupt);
                    self.interrupt = nullptr;
                    once();
                }
            }
        };
        Sink sink{"", interrupt};
        dumped.Dump(Sink::Write, &sink);
        return sink.text;
    }

    bdmv::BlackBox box{3, Ticks};
};

TEST_F(BlackBoxDump, EndsWithTheLastCallbackBeforeItBegan)
{
    Deliver(box, {1, 2});

    EXPECT_EQ(DumpInterruptedBy([this] { Deliver(box, {3}); }), LineOf(1) + LineOf(2));
}

TEST_F(BlackBoxDump, CountsCallbacksThatAreOverwrittenWhileItIsWritten)
{
    Deliver(box, {1, 2, 3});

    EXPECT_EQ(DumpInterruptedBy([this] {
                  Deliver(box, {4, 5});
              }),
              LineOf(1) + GapOf(1, "overwritten", 3) + LineOf(3));
}

TEST_F(BlackBoxDump, EndsWithAGapWhenAllTheRestIsOverwritten)
{
    Deliver(box, {1, 2, 3});

    EXPECT_EQ(DumpInterruptedBy([this] {
                  Deliver(box, {4, 5, 6});
              }),
              LineOf(1) + GapOf(2, "overwritten", 4));
}

TEST_F(BlackBoxDump, CountsOnlyCallbacksBeforeItBegan)
{
    Deliver(box, {1, 2, 3});

    EXPECT_EQ(DumpInterruptedBy([this] {
                  Deliver(box, {4, 5, 6, 7, 8, 9});
              }),
              LineOf(1) + GapOf(2, "overwritten", 7));
}

TEST_F(BlackBoxDump, DistinguishesEarlierLossesFromThoseDuringTheDump)
{
    Deliver(box, {1, 2, 3, 4, 5});

    EXPECT_EQ(DumpInterruptedBy([this] { Deliver(box, {6}); }),
              GapOf(2, "capacity", 3) + GapOf(1, "overwritten", 4) + LineOf(4) + LineOf(5));
}

TEST_F(BlackBoxDump, CutsABlockThatIsOverwrittenWhileItIsWritten)
{
    const std::vector<bd::UInt8> block(1000, 0x11);
    bdmv::BlackBox large(1, Ticks, block.size());
    large.SystemSuspended(block.data(), 1000);

    const std::string dump = DumpInterruptedBy(large, [&large] { Deliver(large, 1); });

    const std::string begin = R"({"ticks":0,"time":"00:00:00.000","interface":"control",)"
                              R"("callback":"SystemSuspended","arguments":{"data":")";
    const std::string end = "\",\"size\":1000}}\n";
    ASSERT_EQ(dump.substr(0, begin.size()), begin);
    ASSERT_EQ(dump.substr(dump.size() - end.size()), end);
    const std::string digits = dump.substr(begin.size(), dump.size() - begin.size() - end.size());
    EXPECT_EQ(digits, std::string(digits.size(), '1'));
    EXPECT_LT(digits.size(), 1000u);
    EXPECT_EQ(digits.size() % 2, 0u);
}

TEST_F(BlackBoxDump, LetsAnotherThreadDeliverWhileASinkWaits)
{
    Deliver(box, {1, 2, 3});

    EXPECT_EQ(DumpInterruptedBy([this] { std::thread([this] {
                                             Deliver(box, {4, 5});
                                         }).join(); }),
              LineOf(1) + GapOf(1, "overwritten", 3) + LineOf(3));
}

TEST_F(BlackBoxDump, TakesTheLockForOneRecordOrPartOfABlockAtATime)
{
    const std::vector<bd::UInt8> block(100);
    bdmv::BlackBox large(2, Ticks, block.size());
    const auto locksOf = [](const auto& action) {
        const std::size_t before = CountMutexLocks();
        action();
        EXPECT_EQ(CountMutexLocks() - before, CountMutexUnlocks() - before);
        return CountMutexLocks() - before;
    };

    EXPECT_EQ(locksOf([&] { large.SystemSuspended(block.data(), 100); }), 1u);
    EXPECT_EQ(locksOf([&] { Deliver(large, 1); }), 1u);
    // The contents, two records, and of the block 64 bytes, 36 bytes and the end.
    EXPECT_EQ(locksOf([&] { DumpOf(large); }), 1u + 2u + 3u);
}

TEST_F(BlackBoxDump, WorksInsideTheSinkOfAnother)
{
    Deliver(box, {1, 2});
    std::string inner;

    const std::string outer = DumpInterruptedBy([&] { inner = DumpOf(box); });

    EXPECT_EQ(outer, LineOf(1) + LineOf(2));
    EXPECT_EQ(inner, outer);
}

/** The fake platform, a list with the box first, and a listener that does what a test wants. */
class BlackBoxInAssert : public BlackBoxDump
{
protected:
    class Client : public bdmv::NavigatorListenerAdapter
    {
    public:
        std::function<void()> onChapter;

        void ChapterNumber(const bd::ChapterNumberDef& /*chapter*/) override { onChapter(); }
    };

    BlackBoxInAssert()
    {
        platform.onAssert = [this] { dump += DumpOf(box); };
        listeners.AddListener(&box);
        listeners.AddListener(&client);
    }

    FakePlatform platform{nullptr};
    ScriptablePlaybackContext context;
    bdmv::INavigatorEvent::Listeners listeners;
    Client client;
    std::string dump;
};

TEST_F(BlackBoxInAssert, WorksInsideACallback)
{
    client.onChapter = [this] { dump = DumpOf(box); };
    bdmv::ChapterEvent(context).Dispatch(listeners);

    EXPECT_EQ(dump, DumpOf(box));
    EXPECT_NE(dump, "");
}

TEST_F(BlackBoxInAssert, HasTheCallbackThatEndsInAssert)
{
    context.currentChapter = 7;
    client.onChapter = [] { Assert("false", "client.cpp", 1); };
    bdmv::ChapterEvent(context).Dispatch(listeners);

    EXPECT_NE(dump.find(R"("callback":"ChapterNumber","arguments":{"chapter":7}})"),
              std::string::npos)
        << dump;
}

TEST_F(BlackBoxInAssert, WorksWhenAnEventEndsInAssert)
{
    Deliver(box, {1, 2});
    context.finishedReason = static_cast<bdstreaming::FinishedReason>(99);
    bdmv::FinishedEvent(context).Dispatch(listeners);

    EXPECT_EQ(dump, LineOf(1) + LineOf(2));
}

TEST_F(BlackBoxInAssert, WorksWhenTheClockOfTheBoxEndsInAssert)
{
    struct Clock {
        static std::uint64_t TicksWithAssert()
        {
            Assert("false", "clock.cpp", 1);
            return Ticks();
        }
    };
    bdmv::BlackBox other(3, Clock::TicksWithAssert);
    platform.onAssert = [&] { dump += DumpOf(other) + "---\n"; };
    Deliver(other, 1);
    Deliver(other, 2);

    EXPECT_EQ(dump, "---\n" + LineOf(1) + "---\n");
}

TEST_F(BlackBoxInAssert, WorksWhenAProgramEndsInAssert)
{
    class AssertingProgram : public bdmv::IProgramData
    {
    public:
        bd::UInt16 GetNumberOfNavigationCommands() const override
        {
            Assert("false", "program.cpp", 1);
            return 1;
        }
        const bdmv::INavigationCommandData*
        GetNavigationCommandData(CommandIdDef /*commandId*/) const override
        {
            return nullptr;
        }
    };
    Deliver(box, {1});
    bdmv::IProgramData::RefPtr program(new AssertingProgram);
    box.ExecuteButton(1, 2, program);

    EXPECT_EQ(dump, LineOf(1));
}

} // namespace
} // namespace bdmvtest

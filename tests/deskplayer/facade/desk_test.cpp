#include "deskplayer/desk.h"

#include <gtest/gtest.h>
#include <unistd.h>

#include <fstream>
#include <stdexcept>
#include <string>
#include <vector>

#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "deskplayer/session.h"
#include "sampledisc.h"

namespace deskplayer
{

namespace
{

namespace fs = std::filesystem;

using bdmvtest::SampleDisc;

TEST(Desk, PlaysTheLongestPlayListUnlessANumberIsGiven)
{
    EXPECT_EQ(Desk(SampleDisc).PlayListNumber(), 1U);
    EXPECT_EQ(Desk(SampleDisc, 2).PlayListNumber(), 2U);
}

TEST(Desk, ThrowsADiscErrorThatNamesWhatWasExpected)
{
    try {
        const Desk desk(BDMVNAVIGATOR_SESSIONS);
        FAIL();
    } catch (const DiscError& error) {
        EXPECT_NE(std::string(error.what()).find("expected a BDMV folder or its parent"),
                  std::string::npos)
            << error.what();
    }
    EXPECT_THROW(Desk(SampleDisc, 3), DiscError);
}

/** A copy of the sample disc whose shorter play list is damaged. */
class DamagedDisc : public testing::Test
{
protected:
    DamagedDisc() : m_Folder(fs::temp_directory_path() / ("desk." + std::to_string(getpid())))
    {
        fs::copy(SampleDisc, m_Folder, fs::copy_options::recursive);
        std::ofstream(m_Folder / "BDMV/PLAYLIST/00002.mpls") << "damaged";
    }

    ~DamagedDisc() override { fs::remove_all(m_Folder); }

    const fs::path m_Folder;
};

TEST_F(DamagedDisc, IsPlayedAndReported)
{
    std::vector<std::string> messages;
    const Desk desk(m_Folder, std::nullopt,
                    [&messages](const std::string& message) { messages.push_back(message); });

    EXPECT_EQ(desk.PlayListNumber(), 1U);
    ASSERT_EQ(messages.size(), 1U);
    EXPECT_EQ(messages[0].rfind("skipped: BDMV/PLAYLIST/00002.mpls: ", 0), 0U) << messages[0];
}

TEST_F(DamagedDisc, IsPlayedWithoutAMessageHandler)
{
    EXPECT_EQ(Desk(m_Folder).PlayListNumber(), 1U);
}

/** Notes the time and the resume data of callbacks. */
class Watcher : public bdmv::NavigatorListenerAdapter
{
public:
    explicit Watcher(const Desk& desk) : m_rDesk(desk) {}

    void Paused() override { pausedAt = m_rDesk.Now(); }
    void SystemSuspended(const void* data, bd::UInt32 size) override
    {
        const auto* const bytes = static_cast<const bd::UInt8*>(data);
        received.assign(bytes, bytes + size);
    }
    void SystemResumed(bool playing) override { resumed = playing; }

    Ticks pausedAt{0};
    std::vector<bd::UInt8> received;
    bool resumed = false;

private:
    const Desk& m_rDesk;
};

/** A desk with a registered listener. */
class DeskWithWatcher : public testing::Test
{
protected:
    DeskWithWatcher() { desk.Listeners().AddListener(&watcher); }

    Desk desk{SampleDisc};
    Watcher watcher{desk};
};

TEST_F(DeskWithWatcher, HasTheTimeOfTheSessionInsideCallbacksToo)
{
    EXPECT_EQ(desk.Now(), Ticks(0));

    const SessionReport report = PlaySession(desk, Session("play\nat 00:20 pause\nafter 3s stop"));

    EXPECT_EQ(report.refused, std::vector<std::string>());
    EXPECT_EQ(watcher.pausedAt, std::chrono::seconds(20));
    EXPECT_EQ(desk.Now(), std::chrono::seconds(23));
}

TEST_F(DeskWithWatcher, WakesUpWithTheResumeDataThatListenersReceived)
{
    EXPECT_TRUE(desk.ResumeData().empty());

    const SessionReport report =
        PlaySession(desk, Session("play\nafter 20s standby\nafter 8h wake"));

    EXPECT_EQ(report.refused, std::vector<std::string>());
    EXPECT_FALSE(watcher.received.empty());
    EXPECT_EQ(desk.ResumeData(), watcher.received);
    EXPECT_TRUE(watcher.resumed);
}

TEST_F(DeskWithWatcher, NotifiesNoListenerThatWasRemoved)
{
    desk.Listeners().RemoveListener(&watcher);

    const SessionReport report = PlaySession(desk, Session("play\nat 00:20 pause"));

    EXPECT_EQ(report.refused, std::vector<std::string>());
    EXPECT_EQ(watcher.pausedAt, Ticks(0));
}

} // namespace

} // namespace deskplayer

// The dump of a session is what the desk player writes for it with --format json.

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <memory>
#include <random>
#include <sstream>
#include <string>
#include <type_traits>
#include <vector>

#include "bd/constants.h"
#include "boxtest.h"
#include "kits/clientkit/everycallback.h"
#include "navigator/deskparts.h"
#include "output/outputformat.h"
#include "samplecallbacks.h"
#include "session/session.h"
#include "testkit/fakeplatform.h"

namespace bdmvtest
{
namespace
{

namespace fs = std::filesystem;

const deskplayer::VirtualClock* g_pClock = nullptr;

std::uint64_t TicksOfTheDesk()
{
    return g_pClock->Now().count();
}

/** A black box beside the desk player's output, both on the same clock. */
class Recording
{
public:
    explicit Recording(const deskplayer::VirtualClock& clock)
        : m_Output(MakeOutput(clock)), m_Box(50000, TicksOfTheDesk, 4096)
    {
        g_pClock = &clock;
    }

    bdmv::INavigatorListener& Output() { return *m_Output; }
    bdmv::BlackBox& Box() { return m_Box; }
    std::string Written() const { return m_Stream.str(); }

private:
    std::unique_ptr<deskplayer::Output> MakeOutput(const deskplayer::VirtualClock& clock)
    {
        deskplayer::OutputSettings options;
        options.format = deskplayer::OutputFormat::Json;
        return deskplayer::MakeOutput(options, m_Stream, clock);
    }

    std::ostringstream m_Stream;
    std::unique_ptr<deskplayer::Output> m_Output;
    bdmv::BlackBox m_Box;
};

/** Expects a dump that equals the output, after @p play has been carried out on a desk. */
template <typename Play> void ExpectEqualAfter(deskplayer::LoadedPlayList playList, Play play)
{
    deskplayer::DeskParts desk(std::move(playList));
    Recording recording(desk.Clock());
    desk.Listeners().AddListener(&recording.Output());
    desk.Listeners().AddListener(&recording.Box());

    play(desk);

    EXPECT_NE(recording.Written(), "");
    // Not EXPECT_EQ: it would print megabytes.
    EXPECT_TRUE(DumpOf(recording.Box()) == recording.Written());
}

deskplayer::LoadedPlayList LongestOf(const fs::path& folder)
{
    const deskplayer::Disc disc(folder.string(), deskplayer::BackupCopies::Use);
    deskplayer::LongestPlayList longest = disc.FindLongestPlayList();
    return deskplayer::LoadPlayList(disc, longest.number, std::move(longest.playList));
}

std::vector<fs::path> EntriesOf(const char* folder)
{
    std::vector<fs::path> entries;
    for (const fs::directory_entry& entry : fs::directory_iterator(folder)) {
        entries.push_back(entry.path());
    }
    return entries;
}

std::string ContentsOf(const fs::path& file)
{
    std::ostringstream text;
    text << std::ifstream(file, std::ios::binary).rdbuf();
    return text.str();
}

TEST(BlackBoxOnTheDesk, DumpsTheSampleSessions)
{
    for (const fs::path& file : EntriesOf(BDMVNAVIGATOR_SESSIONS)) {
        SCOPED_TRACE(file);
        ExpectEqualAfter(LongestOf(BDMVNAVIGATOR_SAMPLE_DISC), [&](deskplayer::DeskParts& desk) {
            const auto steps = deskplayer::ParseScript(ContentsOf(file), file.string(),
                                                       deskplayer::CommandSyntaxes());
            deskplayer::PlaySession(steps, desk, {});
        });
    }
}

TEST(BlackBoxOnTheDesk, DumpsTheTestDiscs)
{
    for (const fs::path& folder : EntriesOf(BDMVNAVIGATOR_TEST_DISCS)) {
        if (fs::is_directory(folder)) {
            SCOPED_TRACE(folder);
            ExpectEqualAfter(LongestOf(folder), [](deskplayer::DeskParts& desk) {
                deskplayer::PlayFromStartToEnd(desk, {});
            });
        }
    }
}

TEST(BlackBoxOnTheDesk, DumpsEveryCallback)
{
    deskplayer::VirtualClock clock;
    Recording recording(clock);
    for (const bdmv::Callback& callback : SampleCallbacks()) {
        const std::uint64_t now = clock.Now().count();
        clock.Advance(deskplayer::Ticks(NextSampleTime(now) - now));
        bdmv::Deliver(callback, recording.Output());
        bdmv::Deliver(callback, recording.Box());
    }
    const std::string dump = DumpOf(recording.Box());
    EXPECT_EQ(dump, recording.Written());

    const std::string golden = ContentsOf(BDMVNAVIGATOR_SAMPLE_DUMP);
    EXPECT_EQ(golden.substr(golden.find('\n') + 1), dump);
}

/** Random arguments: often small or extreme, so that named values and limits occur. */
class RandomArguments
{
public:
    template <typename Number> operator Number()
    {
        std::uint64_t number = m_Random();
        switch (m_Random() % 4) {
        case 0:
            number %= 64;
            break;
        case 1:
            number = ~(number % 4);
            break;
        default:
            break;
        }
        if constexpr (std::is_enum_v<Number>) {
            return static_cast<Number>(static_cast<bd::Int32>(number));
        } else {
            return static_cast<Number>(number);
        }
    }

private:
    std::mt19937_64 m_Random{20}; // NOLINT(cert-msc51-cpp): the same in every run
};

TEST(BlackBoxOnTheDesk, DumpsRandomArguments)
{
    using namespace bdmv::callbacks;
    RandomArguments any;
    deskplayer::VirtualClock clock;
    Recording recording(clock);
    for (int round = 0; round < 500; ++round) {
        bd::AudioInfoType audio;
        audio.format = any;
        audio.sampleRate = any;
        audio.bitsPerSampling = any;
        audio.channels = any;
        audio.pid = any;
        audio.u4AudChannelLayout = any;
        const std::vector<bd::UInt8> block(static_cast<bd::UInt8>(any),
                                           static_cast<bd::UInt8>(any));
        const bdmv::IProgramData::RefPtr program(
            new ProgramOfCommands(static_cast<bd::UInt16>(any)));
        const bdmv::Callback callbacks[] = {
            Stepped{any, any},
            TriggerTimeReached{any, any},
            TriggerSet{any, round % 2 == 0},
            ZoomModeSet{{{any, any, any, any}, {any, any, any, any}, any}},
            Finished{any},
            SystemSuspended{block.data(), static_cast<bd::UInt32>(block.size())},
            PlayItem{any, any, any, any},
            PlayMode{any, any},
            AudioInfoChanged{round % 2 != 0, audio},
            UOMask{bdmv::UOMaskTable(any)},
            MarkInfo{any, any, any},
            CurrentTimePosition{any},
            ExecuteButton{any, any, program},
        };
        clock.Advance(deskplayer::Ticks(static_cast<bd::UInt32>(any)));
        for (const bdmv::Callback& callback : callbacks) {
            bdmv::Deliver(callback, recording.Output());
            bdmv::Deliver(callback, recording.Box());
        }
    }

    EXPECT_TRUE(DumpOf(recording.Box()) == recording.Written());
}

} // namespace
} // namespace bdmvtest

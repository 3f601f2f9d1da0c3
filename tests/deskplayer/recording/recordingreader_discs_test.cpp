// What is written for every play list of every disc, with every sample session, replays as it is.

#include <gtest/gtest.h>

#include <deque>
#include <memory>
#include <sstream>
#include <string>
#include <utility>
#include <vector>

#include "deskplayer/disc/playbacks.h"
#include "deskplayer/disc/testdiscs.h"
#include "disc/disc.h"
#include "keptrecords.h"
#include "kits/clientkit/boxtest.h"
#include "navigator/deskparts.h"
#include "output/outputformat.h"
#include "session/commands.h"
#include "session/session.h"
#include "session/sessionfile.h"

namespace deskplayer
{
namespace
{

const VirtualClock* g_pClock = nullptr;

std::uint64_t TicksOfTheDesk()
{
    return g_pClock->Now().count();
}

/** With colours if it is text. */
OutputSettings SettingsOf(OutputFormat format, const OutputFilter& filter = {})
{
    OutputSettings settings;
    settings.format = format;
    settings.filter = filter;
    settings.coloured = format == OutputFormat::Text;
    return settings;
}

/** A listener that writes what a session gives, with these settings. */
class Writer
{
public:
    Writer(const OutputSettings& settings, const VirtualClock& clock)
        : m_Settings(settings), m_Output(MakeOutput(settings, m_Stream, clock))
    {
    }

    const OutputSettings& Settings() const { return m_Settings; }
    bdmv::INavigatorListener& Listener() { return *m_Output; }

    /** Ends the output. The desk must not be used afterwards. */
    std::string Finish()
    {
        m_Output.reset();
        return m_Stream.str();
    }

private:
    const OutputSettings m_Settings;
    std::ostringstream m_Stream;
    std::unique_ptr<Output> m_Output;
};

/** What a replay of the recording writes. @param end the time of the session at its end */
std::string Replayed(const std::string& recording, const OutputSettings& settings, Ticks end)
{
    std::ostringstream stream;
    VirtualClock clock;
    clock.Advance(end);
    ReadAll(recording, *MakeOutput(settings, stream, clock));
    return stream.str();
}

std::vector<OutputFilter> Filters()
{
    std::vector<OutputFilter> filters(4);
    filters[1].KeepCallbacks("PlayItem,ChapterNumber,SystemSuspended,UOMask");
    filters[2].KeepInterfaces("control,button");
    filters[3].KeepInterfaces("settings");
    filters[3].KeepCallbacks("Paused");
    return filters;
}

/** A desk on which a playback takes place. */
class RecordingOf : public testing::TestWithParam<Playback>
{
protected:
    RecordingOf() : m_Desk(Load(GetParam())) { g_pClock = &m_Desk.Clock(); }

    void Play()
    {
        const std::string& session = GetParam().session.string();
        if (session.empty()) {
            PlayFromStartToEnd(m_Desk, {});
        } else {
            PlaySession(ParseScript(ReadSessionText(session), session, CommandSyntaxes()), m_Desk,
                        {});
        }
    }

    DeskParts m_Desk;

private:
    static LoadedPlayList Load(const Playback& playback)
    {
        const Disc disc(playback.disc.string(), BackupCopies::Use);
        return LoadPlayList(disc, playback.playList, disc.ReadPlayList(playback.playList));
    }
};

TEST_P(RecordingOf, ReplaysAsItWasInEveryFormatThroughEveryFilter)
{
    std::deque<Writer> writers;
    for (const OutputFormat format :
         {OutputFormat::Json, OutputFormat::Text, OutputFormat::Trace}) {
        for (const OutputFilter& filter : Filters()) {
            writers.emplace_back(SettingsOf(format, filter), m_Desk.Clock());
            m_Desk.Listeners().AddListener(&writers.back().Listener());
        }
    }
    Play();

    const Ticks end = m_Desk.Clock().Now();
    const std::string recording = writers.front().Finish();
    EXPECT_NE(recording, "");
    for (Writer& writer : writers) {
        const std::string written = writer.Finish();
        // Not EXPECT_EQ: it would print megabytes.
        EXPECT_TRUE(Replayed(recording, writer.Settings(), end) == written);
        if (writer.Settings().format == OutputFormat::Json) {
            EXPECT_TRUE(Replayed(written, SettingsOf(OutputFormat::Json), end) == written);
        }
    }
}

TEST_P(RecordingOf, ReplaysAsItWasFromABlackBox)
{
    const std::vector<std::pair<std::size_t, std::size_t>> callbacksAndBytes = {
        {5000, 100}, {5000, 3}, {20, 0}, {1, 1}};
    std::deque<bdmv::BlackBox> boxes;
    for (const auto& [callbacks, bytes] : callbacksAndBytes) {
        boxes.emplace_back(callbacks, TicksOfTheDesk, bytes);
        m_Desk.Listeners().AddListener(&boxes.back());
    }
    Play();

    for (const bdmv::BlackBox& box : boxes) {
        const std::string dump = bdmvtest::DumpOf(box);
        EXPECT_NE(dump, "");
        EXPECT_TRUE(WrittenAgain(dump) == dump);
    }
}

INSTANTIATE_TEST_SUITE_P(Disc, RecordingOf, testing::ValuesIn(PlaybacksOf(SampleDiscs())),
                         testing::PrintToStringParamName());
INSTANTIATE_TEST_SUITE_P(FurtherDisc, RecordingOf, testing::ValuesIn(PlaybacksOf(FurtherDiscs())),
                         testing::PrintToStringParamName());

} // namespace
} // namespace deskplayer

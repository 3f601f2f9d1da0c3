#include "program/replay.h"

#include <algorithm>
#include <chrono>
#include <filesystem>
#include <optional>
#include <system_error>
#include <thread>

#include "program/failure.h"
#include "program/progress.h"
#include "program/recordingfile.h"
#include "program/recordwriter.h"
#include "recording/absence.h"
#include "recording/recordingreader.h"
#include "text/printable.h"
#include "text/timetext.h"

namespace deskplayer
{

namespace
{

/** Waits until it is time for a record: the first one is due at once. */
class RealTime
{
public:
    /** A recording whose time jumps back continues at once. */
    void WaitUntil(Ticks time)
    {
        if (!m_Last || time < *m_Last) {
            m_First = time;
            m_Start = std::chrono::steady_clock::now();
        }
        m_Last = time;
        const Ticks wait = std::min(time - m_First, LongestWait);
        std::this_thread::sleep_until(m_Start +
                                      std::chrono::duration_cast<std::chrono::nanoseconds>(wait));
    }

private:
    /** A century: the clock cannot represent all times of a recording. */
    static constexpr Ticks LongestWait = std::chrono::hours(24 * 36525);

    std::optional<Ticks> m_Last;
    Ticks m_First{0};
    std::chrono::steady_clock::time_point m_Start;
};

/** Passes a recording on to an output, when it is time, and counts what is absent. */
class Player : public RecordListener
{
public:
    Player(const Options& options, RecordListener& output, std::ostream& stream)
        : m_rOptions(options), m_rOutput(output), m_rStream(stream), m_Progress(options)
    {
    }

    std::uint64_t Incomplete() const { return m_Incomplete; }
    std::uint64_t Gaps() const { return m_Gaps; }

    /** Removes the progress from the terminal. */
    void Finish() { m_Progress.Clear(); }

    void OnRecord(const CallbackRecord& record) override
    {
        PassTime(record.time);
        CallbackRecord shown = record;
        if (!IsComplete(record)) {
            ++m_Incomplete;
            if (m_rOptions.fill) {
                Fill(shown);
            }
        }
        m_rOutput.OnRecord(shown);
    }

    void OnGap(const GapRecord& gap) override
    {
        PassTime(gap.time);
        ++m_Gaps;
        m_rOutput.OnGap(gap);
    }

    void OnStart(const StartRecord& start) override
    {
        PassTime(start.time);
        m_rOutput.OnStart(start);
    }

private:
    void PassTime(Ticks time)
    {
        m_Progress.Update([time] { return TimeText(time); });
        if (m_rOptions.realTime) {
            m_rStream.flush();
            m_RealTime.WaitUntil(time);
        }
    }

    const Options& m_rOptions;
    RecordListener& m_rOutput;
    std::ostream& m_rStream;
    Progress m_Progress;
    RealTime m_RealTime;
    std::uint64_t m_Incomplete = 0;
    std::uint64_t m_Gaps = 0;
};

/** "1 gap", "2 gaps". */
std::string Counted(std::uint64_t count, const std::string& noun)
{
    return std::to_string(count) + " " + noun + (count == 1 ? "" : "s");
}

} // namespace

void ReplayRecording(const Options& options, const OutputSettings& settings, Target& target)
{
    std::error_code notBothExist;
    if (std::filesystem::equivalent(options.replay, options.output, notBothExist)) {
        throw UsageError("--output: is the recording");
    }
    RecordingFile recording(options.replay);
    RecordingReader reader(recording.Stream(), recording.Name());
    std::ostream& stream = target.Open();
    RecordWriter writer(options, settings, stream);
    Player player(options, writer.Listener(), stream);
    try {
        while (reader.Next(player)) {
        }
    } catch (const RecordingError&) {
        player.Finish();
        writer.Finish();
        target.Finish(); // what could be read
        throw;
    }
    player.Finish();
    writer.Finish();
    if (player.Incomplete() != 0 || player.Gaps() != 0) {
        PrintMessage(Printable(recording.Name()) + ": " + Counted(player.Incomplete(), "callback") +
                     " with absent arguments" + (options.fill ? ", filled; " : "; ") +
                     Counted(player.Gaps(), "gap"));
    }
}

} // namespace deskplayer

/**
 * @file
 * Reads a log back into the callbacks that its lines announce.
 *
 * @code
 * deskplayer::FieldLogReader reader(listener);
 * while (const std::size_t size = ...) {
 *     reader.Read({buffer, size});
 * }
 * reader.EndFile();
 * reader.Finish();
 * @endcode
 *
 * The end of a log is a call of its own: without Finish(), the last callback may be missing.
 */
#ifndef DESKPLAYER_FIELDLOG_FIELDLOGREADER_H
#define DESKPLAYER_FIELDLOG_FIELDLOGREADER_H

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "deskplayer/ticks.h"
#include "fieldlog/eventlines.h"
#include "fieldlog/journalline.h"
#include "fieldlog/logline.h"
#include "fieldlog/logtimeline.h"
#include "fieldlog/prefixpattern.h"
#include "output/record.h"

namespace deskplayer
{

/** What a log consisted of. */
struct FieldLogCounts {
    std::uint64_t callbacks = 0;
    std::uint64_t foreignLines = 0; ///< neither about an event nor about lost lines
    std::uint64_t damagedLines = 0; ///< about an event, but with values that no event writes
};

/**
 * Reads a log from its beginning. Memory does not grow with the log, nor with the length of lines.
 *
 * docs/outputs.md lists the causes of gaps and says where starts are. The wall clock of a start is
 * as the line shows it.
 */
class FieldLogReader
{
public:
    /** Longer lines are foreign. */
    static constexpr std::size_t LongestLine = std::size_t{64} * 1024;

    /**
     * @param listener must outlive the reader; what it throws leaves the operation
     * @param pattern  of the lines; without it, every line is read in whichever of the known forms
     *                 it has
     */
    explicit FieldLogReader(RecordListener& listener,
                            std::optional<PrefixPattern> pattern = std::nullopt);

    /** Reads the next part of the log, which may end anywhere. */
    void Read(std::string_view part);

    /** Ends a file. The next one continues the log. */
    void EndFile();

    /** Ends the log. */
    void Finish();

    const FieldLogCounts& Counts() const { return m_Counts; }

private:
    /** A callback that the next line may revoke or complete. */
    struct Pending {
        LineRole role;
        CallbackRecord record;
    };

    void ReadLine(std::string_view text);
    std::optional<LogLine> TakeApart(std::string_view text);
    void ReadText(const LogLine& line);
    void ReadEvent(const EventText& event);
    bool FollowEvent(const EventText& event);
    void FollowTime(const LogLine& line);
    void Announce(const CallbackRecord& record);
    void SettlePending();
    void Gap(const char* cause, std::optional<std::uint64_t> lost);
    Ticks Now() const { return m_TimeLine.Now(); }

    RecordListener& m_rListener;
    const std::optional<PrefixPattern> m_Pattern;
    JournalLineReader m_JournalLines;
    LogTimeLine m_TimeLine;
    FieldLogCounts m_Counts;
    std::string m_Line;    ///< the beginning of a line whose end has not been read
    std::string m_Text;    ///< of a line, without its escapes
    std::string m_Process; ///< that wrote the last line that was read
    bool m_IsTooLong = false;
    bool m_Restarted = false; ///< the next line that is read is of another run
    std::optional<Pending> m_Pending;
    std::optional<bdmv::CallbackId> m_Event; ///< the first callback of the event of the last line
};

} // namespace deskplayer

#endif

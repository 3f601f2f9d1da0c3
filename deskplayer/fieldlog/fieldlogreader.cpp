#include "fieldlog/fieldlogreader.h"

#include <algorithm>
#include <utility>

#include "bd/logging.h"
#include "fieldlog/textcursor.h"
#include "fieldlog/unescape.h"

namespace deskplayer
{

namespace
{

/** Whether a word of a line names a component or level, by name or by number, or is missing. */
bool Names(std::string_view word, std::string_view name, unsigned number)
{
    return word.empty() || word == name ||
           (TextCursor(word).AtDigit() && word == std::to_string(number));
}

bool IsOfLevel(const LogLine& line, std::string_view name, bd::LogLevelDef level)
{
    return Names(line.level, name, static_cast<unsigned>(level));
}

bool IsOfEvents(const LogLine& line)
{
    return Names(line.component, "BdmvNavigator", bd::CompIdBdmvNavigator) &&
           (IsOfLevel(line, "Event", bd::LogEvent) || IsOfLevel(line, "Warning", bd::LogWarning));
}

/** The number of lines that the port has lost, if the line reports it. */
std::optional<std::uint64_t> LostLines(const LogLine& line)
{
    TextCursor cursor(line.text);
    if (!cursor.Skip("lines lost: ") || !Names(line.component, "Common", bd::CompIdCommon) ||
        !IsOfLevel(line, "Warning", bd::LogWarning)) {
        return std::nullopt;
    }
    const auto lost = cursor.Number(1, 18);
    return lost && cursor.Rest().empty() ? std::optional<std::uint64_t>(*lost) : std::nullopt;
}

/** What journalctl writes between the lines of two boots. */
bool IsBootLine(std::string_view text)
{
    TextCursor cursor(text);
    return cursor.Skip("-- Boot ") || cursor.Skip("-- Reboot --");
}

} // namespace

FieldLogReader::FieldLogReader(RecordListener& listener, std::optional<PrefixPattern> pattern)
    : m_rListener(listener), m_Pattern(std::move(pattern))
{
}

void FieldLogReader::Read(std::string_view part)
{
    while (!part.empty()) {
        const std::size_t end = part.find('\n');
        const std::string_view piece = part.substr(0, end);
        m_IsTooLong = m_IsTooLong || m_Line.size() + piece.size() > LongestLine;
        if (m_IsTooLong) {
            m_Line.clear();
        }
        if (end == std::string_view::npos) {
            if (!m_IsTooLong) {
                m_Line.append(piece);
            }
            return;
        }
        part.remove_prefix(end + 1);
        if (std::exchange(m_IsTooLong, false)) {
            ++m_Counts.foreignLines;
        } else if (m_Line.empty()) {
            ReadLine(piece);
        } else {
            m_Line.append(piece);
            ReadLine(m_Line);
            m_Line.clear();
        }
    }
}

void FieldLogReader::EndFile()
{
    const bool isTruncated = m_IsTooLong || !m_Line.empty();
    m_IsTooLong = false;
    m_Line.clear();
    if (isTruncated) {
        Gap("truncated", std::nullopt);
    }
}

void FieldLogReader::Finish()
{
    SettlePending();
}

void FieldLogReader::ReadLine(std::string_view text)
{
    if (!text.empty() && text.back() == '\r') {
        text.remove_suffix(1);
    }
    m_Restarted = m_Restarted || IsBootLine(text);
    std::optional<LogLine> line = TakeApart(text);
    if (!line) {
        ++m_Counts.foreignLines;
        return;
    }
    line->text = Unescape(line->text, m_Text);
    ReadText(*line);
}

std::optional<LogLine> FieldLogReader::TakeApart(std::string_view text)
{
    if (m_Pattern) {
        return m_Pattern->Read(text);
    }
    return text.substr(0, 1) == "{" ? m_JournalLines.Read(text) : ReadPlainLine(text);
}

void FieldLogReader::ReadText(const LogLine& line)
{
    if (const auto lost = LostLines(line)) {
        FollowTime(line);
        Gap("lost", lost);
        return;
    }
    const EventText event = IsOfEvents(line) ? ReadEventText(line.text) : EventText();
    if (event.kind == EventTextKind::Other) {
        ++m_Counts.foreignLines;
        return;
    }
    FollowTime(line);
    if (event.kind == EventTextKind::Damaged) {
        ++m_Counts.damagedLines;
        SettlePending();
        Gap("damaged", 1);
        return;
    }
    ReadEvent(event);
}

void FieldLogReader::ReadEvent(const EventText& event)
{
    const bool concernsPending =
        m_Pending && m_Pending->record.callback.Id() == event.callback->Id() &&
        m_Pending->role == (event.role == LineRole::Revokes ? LineRole::AnnouncesRevocably
                                                            : LineRole::AnnouncesInPart);
    const bool follows = event.role == LineRole::Revokes || event.role == LineRole::Completes;
    if (follows && concernsPending) {
        m_Pending.reset();
    }
    SettlePending();
    CallbackRecord record{Now(), *event.callback, event.absent};
    record.continuesEvent = FollowEvent(event);
    switch (event.role) {
    case LineRole::Announces:
    case LineRole::Completes:
        Announce(record);
        break;
    case LineRole::AnnouncesRevocably:
    case LineRole::AnnouncesInPart:
        m_Pending = Pending{event.role, record};
        break;
    case LineRole::Revokes:
        break;
    }
}

/** Whether the event of the last line continues. */
bool FieldLogReader::FollowEvent(const EventText& event)
{
    const bool continues = event.continues && event.continues == m_Event;
    if (!event.continues) {
        m_Event = event.callback->Id();
    } else if (!continues) {
        m_Event.reset(); // lines of events that several threads dispatch, or a line is missing
    }
    return continues;
}

void FieldLogReader::FollowTime(const LogLine& line)
{
    const TimeStep step = m_TimeLine.Advance(line.time);
    const bool isOther = line.process != m_Process && !m_Process.empty();
    m_Process = line.process;
    const bool isWall =
        line.time.clock == LineClock::Wall || line.time.clock == LineClock::WallWithoutYear;
    const bool restarted =
        std::exchange(m_Restarted, false) || isOther || step == TimeStep::Restart;
    if (restarted && step != TimeStep::First) {
        SettlePending();
        Gap("restart", std::nullopt);
    }
    if (step == TimeStep::ClockJump) {
        Gap("clock", std::nullopt);
    }
    if (isWall && (restarted || step != TimeStep::Forward)) {
        m_rListener.OnStart({Now(), std::string(line.time.text)});
    }
}

void FieldLogReader::Announce(const CallbackRecord& record)
{
    ++m_Counts.callbacks;
    m_rListener.OnRecord(record);
}

void FieldLogReader::SettlePending()
{
    if (const std::optional<Pending> pending = std::exchange(m_Pending, std::nullopt)) {
        Announce(pending->record);
    }
}

/** What was lost may have revoked the callback that is pending, which is then part of the gap. */
void FieldLogReader::Gap(const char* cause, std::optional<std::uint64_t> lost)
{
    if (m_Pending && m_Pending->role == LineRole::AnnouncesRevocably) {
        m_Pending.reset();
    }
    SettlePending();
    m_Event.reset();
    m_rListener.OnGap({Now(), cause, lost});
}

} // namespace deskplayer

#include "summary/summarywriter.h"

#include <algorithm>
#include <cstdio>
#include <string>
#include <vector>

#include "output/argumentstext.h"
#include "text/names.h"
#include "text/timetext.h"

namespace deskplayer
{

namespace
{

using Cells = std::vector<std::string>;

/** Rows below a heading, in columns that are as wide as their longest cell. */
class Section
{
public:
    /** @param alignment a character for each column: `l` to the left, `r` to the right */
    Section(std::string heading, std::string alignment)
        : m_Heading(std::move(heading)), m_Alignment(std::move(alignment))
    {
    }

    void Add(Cells cells) { m_Rows.push_back(std::move(cells)); }

    /** @param titles of the columns; they are left out if there are no rows */
    void Write(std::ostream& stream, const Cells& titles = {})
    {
        stream << m_Heading << '\n';
        if (m_Rows.empty()) {
            stream << "  none\n";
            return;
        }
        if (!titles.empty()) {
            m_Rows.insert(m_Rows.begin(), titles);
        }
        std::vector<std::size_t> widths(m_Alignment.size());
        for (const Cells& row : m_Rows) {
            for (std::size_t column = 0; column < row.size(); ++column) {
                widths[column] = std::max(widths[column], row[column].size());
            }
        }
        for (const Cells& row : m_Rows) {
            WriteRow(stream, row, widths);
        }
    }

private:
    void WriteRow(std::ostream& stream, const Cells& row,
                  const std::vector<std::size_t>& widths) const
    {
        for (std::size_t column = 0; column < row.size(); ++column) {
            const std::string blanks(widths[column] - row[column].size(), ' ');
            const bool isLast = column + 1 == row.size();
            stream << "  ";
            if (m_Alignment[column] == 'r') {
                stream << blanks << row[column];
            } else {
                stream << row[column] << (isLast ? "" : blanks);
            }
        }
        stream << '\n';
    }

    const std::string m_Heading;
    const std::string m_Alignment;
    std::vector<Cells> m_Rows;
};

/** "12.5 %" */
std::string ShareText(Ticks part, Ticks whole)
{
    char text[32];
    const double share = whole.count() == 0 ? 0
                                            : 100 * static_cast<double>(part.count()) /
                                                  static_cast<double>(whole.count());
    std::snprintf(text, sizeof text, "%.1f %%", share);
    return text;
}

void WriteExtent(std::ostream& stream, const RecordingSummary& summary)
{
    Section section("Recording", "ll");
    if (!summary.wallClock.empty()) {
        section.Add({"wall clock", summary.wallClock});
    }
    section.Add({"begin", TimeText(summary.begin)});
    section.Add({"end", TimeText(summary.end)});
    section.Add({"duration", TimeText(summary.duration)});
    section.Add({"callbacks", std::to_string(summary.callbacks)});
    if (summary.log) {
        section.Add({"foreign lines", std::to_string(summary.log->foreignLines)});
        section.Add({"damaged lines", std::to_string(summary.log->damagedLines)});
    }
    section.Write(stream);
}

void WriteGaps(std::ostream& stream, const RecordingSummary& summary)
{
    Section section("Gaps", "lrrll");
    for (const GapSummary& gap : summary.gaps) {
        section.Add({gap.cause, std::to_string(gap.count),
                     gap.lost ? std::to_string(*gap.lost) : "-", TimeText(gap.first),
                     TimeText(gap.last)});
    }
    section.Write(stream, {"cause", "count", "lost", "first", "last"});
}

void WriteLastCallback(std::ostream& stream, const RecordingSummary& summary)
{
    Section section("Last callback", "lll");
    if (summary.lastCallback) {
        Cells cells = {TimeText(summary.lastCallback->time),
                       NameOf(summary.lastCallback->callback.Id())};
        std::string arguments;
        for (const ArgumentText& argument : ArgumentTexts(*summary.lastCallback)) {
            arguments +=
                (arguments.empty() ? "" : " ") + std::string(argument.name) + "=" + argument.value;
        }
        if (!arguments.empty()) {
            cells.push_back(arguments);
        }
        section.Add(std::move(cells));
    }
    section.Write(stream);
}

void WriteWaits(std::ostream& stream, const RecordingSummary& summary)
{
    Section section("Longest waits within events, of " + std::to_string(summary.waits), "llll");
    for (const Wait& wait : summary.longestWaits) {
        section.Add({TimeText(wait.duration), TimeText(wait.time), NameOf(wait.after),
                     NameOf(wait.before)});
    }
    section.Write(stream, {"wait", "at", "after", "before"});
}

void WriteStates(std::ostream& stream, const RecordingSummary& summary)
{
    Section section("States of playback", "lrrr");
    for (std::size_t state = 0; state < summary.states.size(); ++state) {
        const Periods& periods = summary.states[state];
        if (periods.count > 0) {
            section.Add({SummaryStateNames[state], TimeText(periods.total),
                         ShareText(periods.total, summary.duration),
                         std::to_string(periods.count)});
        }
    }
    section.Write(stream, {"state", "total", "share", "count"});
}

const char* TextOf(const std::optional<bool>& forbidden)
{
    if (!forbidden) {
        return "unknown";
    }
    return *forbidden ? "forbidden" : "permitted";
}

void WriteOperations(std::ostream& stream, const RecordingSummary& summary)
{
    Section section("Forbidden user operations", "lrrl");
    for (std::size_t bit = 0; bit < summary.operations.size(); ++bit) {
        const OperationSummary& operation = summary.operations[bit];
        if (operation.forbidden.count > 0) {
            section.Add({NameOrNumber(static_cast<bd::UserOperationMaskDef>(bit)),
                         TimeText(operation.forbidden.total),
                         std::to_string(operation.forbidden.count),
                         TextOf(operation.forbiddenAtEnd)});
        }
    }
    section.Write(stream, {"operation", "total", "count", "at the end"});
}

void WriteCallbacks(std::ostream& stream, const RecordingSummary& summary)
{
    Section section("Callbacks", "lrll");
    for (std::size_t id = 0; id < summary.callbackKinds.size(); ++id) {
        const CallbackSummary& kind = summary.callbackKinds[id];
        if (kind.count > 0) {
            section.Add({NameOf(static_cast<bdmv::CallbackId>(id)), std::to_string(kind.count),
                         TimeText(kind.first), TimeText(kind.last)});
        }
    }
    section.Write(stream, {"callback", "count", "first", "last"});
}

} // namespace

void WriteSummary(std::ostream& stream, const RecordingSummary& summary)
{
    WriteExtent(stream, summary);
    for (const auto write :
         {WriteGaps, WriteLastCallback, WriteWaits, WriteStates, WriteOperations, WriteCallbacks}) {
        if (write != WriteWaits || summary.log) {
            stream << '\n';
            write(stream, summary);
        }
    }
}

} // namespace deskplayer

#include "output/jsonoutput.h"

#include <cstddef>
#include <string_view>
#include <utility>

#include <nlohmann/json.hpp>

#include "clientkit/jsonline.h"
#include "output/arguments.h"

namespace deskplayer
{

namespace
{

/** The end of every line that is composed. */
constexpr std::string_view End = "}\n";

void AppendTo(void* line, const char* bytes, std::size_t size)
{
    static_cast<std::string*>(line)->append(bytes, size);
}

/** The end of a line with these tags. */
std::string EndWith(const Tags& tags)
{
    return (tags.empty() ? std::string() : ",\"tags\":" + TagsJson(tags)) + std::string(End);
}

} // namespace

JsonOutput::JsonOutput(std::ostream& stream, const VirtualClock& clock, const OutputFilter& filter,
                       Tags tags)
    : Output(stream, clock, filter), m_Tags(std::move(tags)), m_LineEnd(EndWith(m_Tags))
{
}

void JsonOutput::Write(const CallbackRecord& record)
{
    bdmv::JsonLine line(AppendTo, &m_Line);
    line.Begin(record.time.count(), record.callback.Id());
    VisitPresentArguments(record, line);
    line.End();
    WriteLine(record.tags);
}

void JsonOutput::Write(const GapRecord& gap)
{
    bdmv::JsonLine line(AppendTo, &m_Line);
    if (gap.lost) {
        line.Gap(gap.time.count(), *gap.lost, gap.cause.c_str());
    } else {
        line.Gap(gap.time.count(), gap.cause.c_str());
    }
    WriteLine(gap.tags);
}

void JsonOutput::Write(const StartRecord& start)
{
    const nlohmann::ordered_json line = {{"ticks", start.time.count()},
                                         {"start", {{"wallClock", start.wallClock}}}};
    m_Line = line.dump() + '\n';
    WriteLine(start.tags);
}

void JsonOutput::WriteLine(const Tags& ofRecord)
{
    m_Line.resize(m_Line.size() - End.size());
    if (ofRecord.empty()) {
        m_Line += m_LineEnd;
    } else {
        Tags tags = m_Tags;
        tags.insert(ofRecord.begin(), ofRecord.end());
        m_Line += EndWith(tags);
    }
    Stream() << m_Line;
    m_Line.clear();
}

} // namespace deskplayer

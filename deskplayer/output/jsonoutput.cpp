#include "output/jsonoutput.h"

#include <cstddef>

#include <nlohmann/json.hpp>

#include "clientkit/jsonline.h"
#include "output/arguments.h"

namespace deskplayer
{

namespace
{

void WriteTo(void* stream, const char* bytes, std::size_t size)
{
    static_cast<std::ostream*>(stream)->write(bytes, static_cast<std::streamsize>(size));
}

} // namespace

void JsonOutput::Write(const CallbackRecord& record)
{
    bdmv::JsonLine line(WriteTo, &Stream());
    line.Begin(record.time.count(), record.callback.Id());
    VisitPresentArguments(record, line);
    line.End();
}

void JsonOutput::Write(const GapRecord& gap)
{
    bdmv::JsonLine line(WriteTo, &Stream());
    if (gap.lost) {
        line.Gap(gap.time.count(), *gap.lost, gap.cause.c_str());
    } else {
        line.Gap(gap.time.count(), gap.cause.c_str());
    }
}

void JsonOutput::Write(const StartRecord& start)
{
    const nlohmann::ordered_json line = {{"ticks", start.time.count()},
                                         {"start", {{"wallClock", start.wallClock}}}};
    Stream() << line.dump() << '\n';
}

} // namespace deskplayer

#include "output/jsonoutput.h"

#include "output/argumentsjson.h"
#include "text/timetext.h"

namespace deskplayer
{

void JsonOutput::Write(const bdmv::Callback& callback)
{
    const Ticks now = Now();
    const nlohmann::ordered_json line = {{"ticks", now.count()},
                                         {"time", TimeText(now)},
                                         {"interface", NameOf(InterfaceOf(callback.Id()))},
                                         {"callback", NameOf(callback.Id())},
                                         {"arguments", ArgumentsJson(callback)}};
    Stream() << line.dump() << '\n';
}

} // namespace deskplayer

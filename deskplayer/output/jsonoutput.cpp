#include "output/jsonoutput.h"

#include "output/argumentsjson.h"
#include "text/timetext.h"

namespace deskplayer
{

void JsonOutput::Write(const Callback& callback)
{
    const CallbackInfo& info = InfoOf(callback.id);
    const Ticks now = Now();
    const nlohmann::ordered_json line = {{"ticks", now.count()},
                                         {"time", TimeText(now)},
                                         {"interface", NameOf(info.interface)},
                                         {"callback", info.name},
                                         {"arguments", ArgumentsJson(callback)}};
    Stream() << line.dump() << '\n';
}

} // namespace deskplayer

#include "output/jsonoutput.h"

#include "output/argumentsjson.h"
#include "output/timetext.h"

namespace deskplayer
{

void JsonOutput::Write(const Callback& callback)
{
    const CallbackInfo& info = InfoOf(callback.id);
    const std::uint64_t now = Now();
    const nlohmann::ordered_json line = {{"ticks", now},
                                         {"time", TimeText(now)},
                                         {"interface", NameOf(info.interface)},
                                         {"callback", info.name},
                                         {"arguments", ArgumentsJson(callback)}};
    Stream() << line.dump() << '\n';
}

} // namespace deskplayer

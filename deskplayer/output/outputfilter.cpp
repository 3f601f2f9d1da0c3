#include "output/outputfilter.h"

#include <algorithm>
#include <vector>

#include "text/choice.h"

namespace deskplayer
{

void OutputFilter::KeepInterfaces(std::string_view interfaces)
{
    const std::vector<std::string_view> names(InterfaceNames.begin(), InterfaceNames.end());
    CallbackSet kept;
    for (const std::size_t chosen : FindChoices(interfaces, "a listener interface", names)) {
        for (std::size_t id = 0; id < AllCallbacks.size(); ++id) {
            if (AllCallbacks[id].interface == static_cast<ListenerInterface>(chosen)) {
                kept.set(id);
            }
        }
    }
    m_Passing &= kept;
}

void OutputFilter::KeepCallbacks(std::string_view callbacks)
{
    std::vector<std::string_view> names(AllCallbacks.size());
    std::transform(AllCallbacks.begin(), AllCallbacks.end(), names.begin(),
                   [](const CallbackInfo& info) { return info.name; });
    CallbackSet kept;
    for (const std::size_t id : FindChoices(callbacks, "a callback", names)) {
        kept.set(id);
    }
    m_Passing &= kept;
}

} // namespace deskplayer

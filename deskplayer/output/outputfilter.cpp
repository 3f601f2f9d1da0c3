#include "output/outputfilter.h"

#include <vector>

#include "text/choice.h"
#include "text/names.h"

namespace deskplayer
{

void OutputFilter::KeepInterfaces(std::string_view interfaces)
{
    std::vector<std::string_view> names;
    names.reserve(bdmv::ListenerInterface__sizeof);
    for (int interface = 0; interface < bdmv::ListenerInterface__sizeof; ++interface) {
        names.emplace_back(NameOf(static_cast<bdmv::ListenerInterface>(interface)));
    }
    CallbackSet kept;
    for (const std::size_t chosen : FindChoices(interfaces, "a listener interface", names)) {
        for (std::size_t id = 0; id < kept.size(); ++id) {
            if (InterfaceOf(static_cast<bdmv::CallbackId>(id)) ==
                static_cast<bdmv::ListenerInterface>(chosen)) {
                kept.set(id);
            }
        }
    }
    m_Passing &= kept;
}

void OutputFilter::KeepCallbacks(std::string_view callbacks)
{
    CallbackSet kept;
    for (const std::size_t id : FindChoices(callbacks, "a callback", CallbackNames())) {
        kept.set(id);
    }
    m_Passing &= kept;
}

} // namespace deskplayer

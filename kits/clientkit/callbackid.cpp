#include "clientkit/callbackid.h"

namespace bdmv
{

namespace
{

struct CallbackRow {
    ListenerInterface interface;
    const char* name;
};

const CallbackRow g_Callbacks[] = {
#define BDMV_CALLBACK_ROW(interface, name) {ListenerInterface##interface, #name},
    BDMV_CALLBACKS(BDMV_CALLBACK_ROW)
#undef BDMV_CALLBACK_ROW
};

const char* const g_Interfaces[] = {"control", "settings", "button", "interactive"};

bool IsCallback(CallbackId id)
{
    return id >= 0 && id < Callback__sizeof;
}

} // namespace

const char* NameOf(CallbackId id)
{
    return IsCallback(id) ? g_Callbacks[id].name : "unknown";
}

ListenerInterface InterfaceOf(CallbackId id)
{
    return IsCallback(id) ? g_Callbacks[id].interface : ListenerInterface__sizeof;
}

const char* NameOf(ListenerInterface interface)
{
    return interface >= 0 && interface < ListenerInterface__sizeof ? g_Interfaces[interface]
                                                                   : "unknown";
}

} // namespace bdmv

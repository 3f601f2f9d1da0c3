// A product with its own implementation of the platform interface.
#include <cstdio>
#include <cstring>

#include "bd/logging.h"
#include "bdmvnavigator/inavigatorevent.h"
#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "kevro/kevro_osa.h"

static char written[100];

int g_u1Bduopmask = 0;
KEVRO_Bool KEVRO_Log_IsEnabled(KEVRO_UInt32, KEVRO_Int32, KEVRO_Bool)
{
    return 1;
}
void KEVRO_Log_VWrite(KEVRO_UInt32, KEVRO_Int32, KEVRO_Bool, const char* format, va_list args)
{
    std::vsnprintf(written, sizeof written, format, args);
}
KEVRO_Int32 KEVRO_Osa_TaskAtomicAdd(KEVRO_Int32* counter, KEVRO_Int32 delta)
{
    return __atomic_add_fetch(counter, delta, __ATOMIC_SEQ_CST);
}
void Assert(const char*, const char*, int) {}

struct Listener : bdmv::NavigatorListenerAdapter {
    int paused = 0;
    void Paused() override { ++paused; }
};

int main()
{
    bd::EventListenerList<bdmv::INavigatorListener> listeners;
    Listener listener;
    listeners.AddListener(&listener);
    bd::EventListenerList_FireParam0(listeners, &bdmv::INavigatorListener::Paused);
    bd::VargLogger(bd::CompIdTest, KEVRO_Log_LevelInfo, 0).Log("paused %d", listener.paused);
    return std::strcmp(written, "paused 1") == 0 ? 0 : 1;
}

// The example of kits/clientkit/blackbox.h as a program: a listener that meets what it does not
// expect calls Assert(), and the port of the player dumps the black box.

#include <atomic>
#include <chrono>
#include <cstdarg>
#include <cstdio>

#include "bd/eventlistenerlist.h"
#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "clientkit/blackbox.h"
#include "kevro/kevro_log.h"
#include "kevro/kevro_osa.h"

namespace
{

std::atomic<const bdmv::BlackBox*> g_pBlackBox(nullptr);

void WriteToReport(void* report, const char* bytes, std::size_t size)
{
    std::fwrite(bytes, 1, size, static_cast<std::FILE*>(report));
}

} // namespace

extern "C" void Assert(const char* expression, const char* file, int line)
{
    std::fprintf(stderr, "%s:%d: %s\n", file, line, expression);
    if (const bdmv::BlackBox* const box = g_pBlackBox) {
        box->Dump(WriteToReport, stderr);
    }
}

// The rest of the port.

int g_u1Bduopmask = 0;

extern "C" KEVRO_Bool KEVRO_Log_IsEnabled(KEVRO_UInt32 /*component*/, KEVRO_Int32 /*level*/,
                                          KEVRO_Bool /*hiFreq*/)
{
    return 0;
}

extern "C" void KEVRO_Log_VWrite(KEVRO_UInt32 /*component*/, KEVRO_Int32 /*level*/,
                                 KEVRO_Bool /*hiFreq*/, const char* /*format*/, va_list /*args*/)
{
}

extern "C" KEVRO_Int32 KEVRO_Osa_TaskAtomicAdd(KEVRO_Int32* counter, KEVRO_Int32 delta)
{
    return __atomic_add_fetch(counter, delta, __ATOMIC_SEQ_CST);
}

namespace
{

std::uint64_t TicksSinceStart()
{
    static const std::chrono::steady_clock::time_point start = std::chrono::steady_clock::now();
    const std::chrono::microseconds time = std::chrono::duration_cast<std::chrono::microseconds>(
        std::chrono::steady_clock::now() - start);
    return static_cast<std::uint64_t>(time.count()) * 9 / 200;
}

class FrontPanel : public bdmv::NavigatorListenerAdapter
{
public:
    void ChapterNumber(const bd::ChapterNumberDef& chapter) override
    {
        if (chapter == 3) {
            Assert("chapter != 3", __FILE__, __LINE__);
        }
    }
};

} // namespace

int main()
{
    bd::EventListenerList<bdmv::INavigatorListener> navigatorListeners;
    FrontPanel frontPanel;

    bdmv::BlackBox* const box = new bdmv::BlackBox(1000, TicksSinceStart);
    g_pBlackBox = box;
    navigatorListeners.AddListener(box);

    navigatorListeners.AddListener(&frontPanel);
    for (const bd::ChapterNumberDef chapter : {bd::ChapterNumberDef(2), bd::ChapterNumberDef(3)}) {
        bd::EventListenerList_FireParam1(navigatorListeners,
                                         &bdmv::INavigatorListener::ChapterNumber, chapter);
    }
    navigatorListeners.RemoveListener(&frontPanel);

    navigatorListeners.RemoveListener(box);
}

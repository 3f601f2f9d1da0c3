#include "support/fakeplatform.h"

#include <array>
#include <atomic>
#include <cstdio>
#include <cstdlib>
#include <utility>

#include "database/uomasktable.h"
#include "kevro/kevro_osa.h"
#include "support/describe.h"

int g_u1Bduopmask = 0;

namespace bdmvtest
{

namespace
{

std::atomic<FakePlatform*> installed{nullptr};

std::string DescribeTag(KEVRO_UInt32 component, KEVRO_Int32 level, KEVRO_Bool hiFreq)
{
    return Describe(component) + " " + Describe(level) + " " + Describe(hiFreq);
}

} // namespace

/** Gives the platform functions access to the installed fake platform. */
struct FakePlatformAccess {
    static KEVRO_Bool IsEnabled(const FakePlatform& platform, KEVRO_UInt32 component,
                                KEVRO_Int32 level, KEVRO_Bool hiFreq)
    {
        const KEVRO_Bool enabled = platform.m_LogSwitch(component, level, hiFreq);
        if (platform.m_pJournal != nullptr) {
            platform.m_pJournal->Add("log? " + DescribeTag(component, level, hiFreq) +
                                     (enabled != 0 ? " -> on" : " -> off"));
        }
        return enabled;
    }

    static void Write(const FakePlatform& platform, KEVRO_UInt32 component, KEVRO_Int32 level,
                      KEVRO_Bool hiFreq, const char* format, const char* text)
    {
        if (platform.m_pJournal != nullptr) {
            if (platform.m_RecordsFormats) {
                platform.m_pJournal->Add(std::string("format: ") + format);
            }
            platform.m_pJournal->Add("log " + DescribeTag(component, level, hiFreq) + ": " + text);
        }
    }

    static void Add(const FakePlatform& platform, KEVRO_Int32 delta, KEVRO_Int32 result)
    {
        if (platform.m_RecordsAtomicAdds && delta != 0) {
            platform.m_pJournal->Add("atomic add " + Describe(delta) + " -> " + Describe(result));
        }
    }

    static void Assert(const FakePlatform& platform, const char* expression, const char* file,
                       int line)
    {
        if (platform.m_pJournal != nullptr) {
            platform.m_pJournal->Add(std::string("assert: ") + expression + ", " + file + ":" +
                                     Describe(line));
        }
        if (platform.onAssert) {
            platform.onAssert();
        }
    }
};

FakePlatform::FakePlatform(Journal* journal)
    : m_pJournal(journal),
      m_LogSwitch([](KEVRO_UInt32, KEVRO_Int32, KEVRO_Bool) -> KEVRO_Bool { return 1; })
{
    FakePlatform* none = nullptr;
    if (!installed.compare_exchange_strong(none, this)) {
        std::fputs("bdmvtest::FakePlatform: already installed\n", stderr);
        std::abort();
    }
}

FakePlatform::~FakePlatform()
{
    installed = nullptr;
    g_u1Bduopmask = 0;
}

void FakePlatform::SetLogSwitch(LogSwitch logSwitch)
{
    m_LogSwitch = std::move(logSwitch);
}

void FakePlatform::DisableLog()
{
    SetLogSwitch([](KEVRO_UInt32, KEVRO_Int32, KEVRO_Bool) -> KEVRO_Bool { return 0; });
}

void FakePlatform::RecordFormats()
{
    m_RecordsFormats = true;
}

void FakePlatform::RecordAtomicAdds()
{
    m_RecordsAtomicAdds = true;
}

} // namespace bdmvtest

using bdmvtest::FakePlatformAccess;
using bdmvtest::installed;

KEVRO_Bool KEVRO_Log_IsEnabled(KEVRO_UInt32 component, KEVRO_Int32 level, KEVRO_Bool hiFreq)
{
    const bdmvtest::FakePlatform* const platform = installed;
    return platform == nullptr ? 0
                               : FakePlatformAccess::IsEnabled(*platform, component, level, hiFreq);
}

void KEVRO_Log_VWrite(KEVRO_UInt32 component, KEVRO_Int32 level, KEVRO_Bool hiFreq,
                      const char* format, va_list args)
{
    std::array<char, 1024> text;
    std::vsnprintf(text.data(), text.size(), format, args);
    if (const bdmvtest::FakePlatform* const platform = installed) {
        FakePlatformAccess::Write(*platform, component, level, hiFreq, format, text.data());
    }
}

KEVRO_Int32 KEVRO_Osa_TaskAtomicAdd(KEVRO_Int32* counter, KEVRO_Int32 delta)
{
    const KEVRO_Int32 result = __atomic_add_fetch(counter, delta, __ATOMIC_SEQ_CST);
    if (const bdmvtest::FakePlatform* const platform = installed) {
        FakePlatformAccess::Add(*platform, delta, result);
    }
    return result;
}

void Assert(const char* expression, const char* file, int line)
{
    const bdmvtest::FakePlatform* const platform = installed;
    if (platform == nullptr) {
        std::fprintf(stderr, "%s:%d: assertion failed: %s\n", file, line, expression);
        std::abort();
    }
    FakePlatformAccess::Assert(*platform, expression, file, line);
}

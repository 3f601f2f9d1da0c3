/**
 * @file
 * A platform that records the calls it receives.
 *
 * @code
 * bdmvtest::Journal journal;
 * bdmvtest::FakePlatform platform(&journal);
 * event.Dispatch(listeners);
 * EXPECT_EQ(journal.Take(), "log? 57 5 0 -> on\nlog 57 5 0: Sending Paused\n");
 * @endcode
 *
 * Entries in the journal:
 *
 *     log? 57 5 0 -> on                         KEVRO_Log_IsEnabled
 *     format: Sending PlayStarted               the format of the line below, when asked for
 *     log 57 5 0: Sending PlayStarted           KEVRO_Log_VWrite
 *     atomic add -1 -> 0                        KEVRO_Osa_TaskAtomicAdd, when asked for
 *     assert: false, some/file.cpp:885          Assert
 *
 * At least one source of a test program includes this header, and as many as like may: it defines
 * the platform's functions and ::g_u1Bduopmask as weak symbols. They replace those of a port that
 * is linked as a static or a shared library. A source of the program that defines one of them
 * itself replaces the fake one; so does a member of a port's static library that the program links
 * for another function.
 */
#ifndef TESTKIT_FAKEPLATFORM_H
#define TESTKIT_FAKEPLATFORM_H

#include <array>
#include <atomic>
#include <cstdarg>
#include <cstdio>
#include <cstdlib>
#include <functional>
#include <stdexcept>
#include <string>
#include <utility>

#include "database/uomasktable.h"
#include "kevro/kevro_log.h"
#include "kevro/kevro_osa.h"
#include "testkit/describe.h"
#include "testkit/journal.h"

namespace bdmvtest
{

/**
 * Handles the calls of the platform functions while it lives. Only one may exist at a time.
 *
 * Without a fake platform the log switch is off, the atomic addition works, and a failed assertion
 * aborts the program, so that none is missed.
 *
 * Set it up before other threads use it. The functions themselves may be called from several
 * threads at once.
 */
class FakePlatform
{
public:
    /** Takes the place of KEVRO_Log_IsEnabled(). */
    typedef std::function<KEVRO_Bool(KEVRO_UInt32 component, KEVRO_Int32 level, KEVRO_Bool hiFreq)>
        LogSwitch;

    /**
     * Installs itself, with the log switch on for everything.
     *
     * @param journal receives the entries; if null, lines are formatted and discarded without
     *                allocating
     * @throw std::logic_error if there is a fake platform already
     */
    explicit FakePlatform(Journal* journal) : m_pJournal(journal)
    {
        SetLogSwitch([](KEVRO_UInt32, KEVRO_Int32, KEVRO_Bool) -> KEVRO_Bool { return 1; });
        FakePlatform* none = nullptr;
        if (!s_Installed.compare_exchange_strong(none, this)) {
            throw std::logic_error("bdmvtest::FakePlatform: already installed");
        }
    }

    /** Uninstalls itself and clears ::g_u1Bduopmask. */
    ~FakePlatform()
    {
        s_Installed = nullptr;
        g_u1Bduopmask = 0;
    }

    FakePlatform(const FakePlatform&) = delete;
    FakePlatform& operator=(const FakePlatform&) = delete;

    /** Replaces the log switch; its caller receives the value that @p logSwitch returns. */
    void SetLogSwitch(LogSwitch logSwitch) { m_LogSwitch = std::move(logSwitch); }

    /** Switches everything off. */
    void DisableLog()
    {
        SetLogSwitch([](KEVRO_UInt32, KEVRO_Int32, KEVRO_Bool) -> KEVRO_Bool { return 0; });
    }

    /** Records the format of every line before the line. */
    void RecordFormats() { m_RecordsFormats = true; }

    /** Records atomic additions as well, except those that only read. */
    void RecordAtomicAdds() { m_RecordsAtomicAdds = true; }

    /** Called by Assert() after it has written its entry; may throw. */
    std::function<void()> onAssert;

private:
    friend KEVRO_Bool(::KEVRO_Log_IsEnabled)(KEVRO_UInt32 component, KEVRO_Int32 level,
                                             KEVRO_Bool hiFreq);
    friend void(::KEVRO_Log_VWrite)(KEVRO_UInt32 component, KEVRO_Int32 level, KEVRO_Bool hiFreq,
                                    const char* format, va_list args);
    friend KEVRO_Int32(::KEVRO_Osa_TaskAtomicAdd)(KEVRO_Int32* counter, KEVRO_Int32 delta);
    friend void(::Assert)(const char* expression, const char* file, int line);

    static std::string DescribeTag(KEVRO_UInt32 component, KEVRO_Int32 level, KEVRO_Bool hiFreq)
    {
        return Describe(component) + " " + Describe(level) + " " + Describe(hiFreq);
    }

    KEVRO_Bool IsEnabled(KEVRO_UInt32 component, KEVRO_Int32 level, KEVRO_Bool hiFreq) const
    {
        const KEVRO_Bool enabled = m_LogSwitch(component, level, hiFreq);
        if (m_pJournal != nullptr) {
            m_pJournal->Add("log? " + DescribeTag(component, level, hiFreq) +
                            (enabled != 0 ? " -> on" : " -> off"));
        }
        return enabled;
    }

    void Write(KEVRO_UInt32 component, KEVRO_Int32 level, KEVRO_Bool hiFreq, const char* format,
               const char* text) const
    {
        if (m_pJournal != nullptr) {
            if (m_RecordsFormats) {
                m_pJournal->Add(std::string("format: ") + format);
            }
            m_pJournal->Add("log " + DescribeTag(component, level, hiFreq) + ": " + text);
        }
    }

    void Add(KEVRO_Int32 delta, KEVRO_Int32 result) const
    {
        if (m_pJournal != nullptr && m_RecordsAtomicAdds && delta != 0) {
            m_pJournal->Add("atomic add " + Describe(delta) + " -> " + Describe(result));
        }
    }

    void Fail(const char* expression, const char* file, int line) const
    {
        if (m_pJournal != nullptr) {
            m_pJournal->Add(std::string("assert: ") + expression + ", " + file + ":" +
                            Describe(line));
        }
        if (onAssert) {
            onAssert();
        }
    }

    static inline std::atomic<FakePlatform*> s_Installed{nullptr};

    Journal* m_pJournal;
    LogSwitch m_LogSwitch;
    bool m_RecordsFormats = false;
    bool m_RecordsAtomicAdds = false;
};

} // namespace bdmvtest

/// @cond The platform interface documents its functions.
__attribute__((weak)) int g_u1Bduopmask = 0;

__attribute__((weak)) KEVRO_Bool KEVRO_Log_IsEnabled(KEVRO_UInt32 component, KEVRO_Int32 level,
                                                     KEVRO_Bool hiFreq)
{
    const bdmvtest::FakePlatform* const platform = bdmvtest::FakePlatform::s_Installed;
    return platform == nullptr ? 0 : platform->IsEnabled(component, level, hiFreq);
}

__attribute__((weak)) void KEVRO_Log_VWrite(KEVRO_UInt32 component, KEVRO_Int32 level,
                                            KEVRO_Bool hiFreq, const char* format, va_list args)
{
    std::array<char, 1024> text;
    std::vsnprintf(text.data(), text.size(), format, args);
    if (const bdmvtest::FakePlatform* const platform = bdmvtest::FakePlatform::s_Installed) {
        platform->Write(component, level, hiFreq, format, text.data());
    }
}

__attribute__((weak)) KEVRO_Int32 KEVRO_Osa_TaskAtomicAdd(KEVRO_Int32* counter, KEVRO_Int32 delta)
{
    const KEVRO_Int32 result = __atomic_add_fetch(counter, delta, __ATOMIC_SEQ_CST);
    if (const bdmvtest::FakePlatform* const platform = bdmvtest::FakePlatform::s_Installed) {
        platform->Add(delta, result);
    }
    return result;
}

__attribute__((weak)) void Assert(const char* expression, const char* file, int line)
{
    const bdmvtest::FakePlatform* const platform = bdmvtest::FakePlatform::s_Installed;
    if (platform == nullptr) {
        std::fprintf(stderr, "%s:%d: assertion failed: %s\n", file, line, expression);
        std::abort();
    }
    platform->Fail(expression, file, line);
}
/// @endcond

#endif

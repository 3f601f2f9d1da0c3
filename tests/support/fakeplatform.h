/**
 * @file
 * A platform that records the calls it receives.
 *
 * Entries in the journal:
 *
 *     log? 57 5 0 -> on                         KEVRO_Log_IsEnabled
 *     format: Sending PlayStarted               the format of the line below, when asked for
 *     log 57 5 0: Sending PlayStarted           KEVRO_Log_VWrite
 *     atomic add -1 -> 0                        KEVRO_Osa_TaskAtomicAdd, when asked for
 *     assert: false, some/file.cpp:885          Assert
 */
#ifndef SUPPORT_FAKEPLATFORM_H
#define SUPPORT_FAKEPLATFORM_H

#include <functional>

#include "kevro/kevro_log.h"
#include "support/journal.h"

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
    typedef std::function<KEVRO_Bool(KEVRO_UInt32 component, KEVRO_Int32 level, KEVRO_Bool hiFreq)>
        LogSwitch;

    /**
     * Installs itself, with the log switch on for everything.
     *
     * @param journal receives the entries; if null, lines are formatted and discarded without
     *                allocating
     */
    explicit FakePlatform(Journal* journal);

    /** Uninstalls itself and clears ::g_u1Bduopmask. */
    ~FakePlatform();

    FakePlatform(const FakePlatform&) = delete;
    FakePlatform& operator=(const FakePlatform&) = delete;

    /** Replaces the log switch; its caller receives the value that @p logSwitch returns. */
    void SetLogSwitch(LogSwitch logSwitch);

    /** Switches everything off. */
    void DisableLog();

    /** Records the format of every line before the line. */
    void RecordFormats();

    /** Records atomic additions as well, except those that only read. */
    void RecordAtomicAdds();

    /** Called by Assert() after it has written its entry; may throw. */
    std::function<void()> onAssert;

private:
    friend struct FakePlatformAccess;

    Journal* m_pJournal;
    LogSwitch m_LogSwitch;
    bool m_RecordsFormats = false;
    bool m_RecordsAtomicAdds = false;
};

} // namespace bdmvtest

#endif

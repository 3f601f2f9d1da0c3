/**
 * @file
 * A platform that records what is asked of it.
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
 * Stands behind the platform functions for as long as it lives. One at a time.
 *
 * With no fake platform in place the log switch is off, the atomic addition works, and an assertion
 * ends the program, so that none goes unnoticed.
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
     * @param journal receives the entries; null for none: lines are then formatted and forgotten
     *                without allocating
     */
    explicit FakePlatform(Journal* journal);

    /** Takes itself out and clears ::g_u1Bduopmask. */
    ~FakePlatform();

    FakePlatform(const FakePlatform&) = delete;
    FakePlatform& operator=(const FakePlatform&) = delete;

    /** Decides about every line; what it returns is what the caller of the switch gets. */
    void SetLogSwitch(LogSwitch logSwitch);

    /** Switches everything off. */
    void DisableLog();

    /** Has the format of every line stand in the journal before the line. */
    void RecordFormats();

    /** Has atomic additions stand in the journal as well, other than those that only read. */
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

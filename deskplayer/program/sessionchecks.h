/**
 * @file
 * Whether a session went as its author demands.
 */
#ifndef DESKPLAYER_PROGRAM_SESSIONCHECKS_H
#define DESKPLAYER_PROGRAM_SESSIONCHECKS_H

#include <cstddef>
#include <string>
#include <vector>

#include "output/callbackrecorder.h"
#include "program/options.h"
#include "session/session.h"

namespace deskplayer
{

/** Reports what goes wrong in a session, and remembers whether that makes the session fail. */
class SessionChecks
{
public:
    /**
     * Registers a listener at the desk if the session has expectations.
     *
     * @param options and @p desk must outlive the checks
     */
    SessionChecks(const Options& options, const std::vector<ScriptStep>& steps, Desk& desk);

    ~SessionChecks() { m_rDesk.Listeners().RemoveListener(&m_Recorder); }
    SessionChecks(const SessionChecks&) = delete;
    SessionChecks& operator=(const SessionChecks&) = delete;

    /** Makes a session call the checks, which must outlive it. */
    void AddTo(SessionHooks& hooks);

    bool HaveFailed() const { return m_Failed; }

private:
    void CheckExpectation(const ScriptStep& step);
    void Report(std::size_t line, const std::string& message) const;
    void ReportRefusal(std::size_t line, const std::string& reason);

    const Options& m_rOptions;
    Desk& m_rDesk;
    CallbackRecorder m_Recorder;
    bool m_Failed = false;
};

} // namespace deskplayer

#endif

/**
 * @file
 * Whether a session went as its author demands.
 */
#ifndef DESKPLAYER_PROGRAM_SESSIONCHECKS_H
#define DESKPLAYER_PROGRAM_SESSIONCHECKS_H

#include <cstddef>
#include <string>

#include "program/options.h"
#include "session/session.h"

namespace deskplayer
{

/** Reports what goes wrong in a session, and remembers whether that makes the session fail. */
class SessionChecks
{
public:
    /** @param options and @p desk must outlive the checks */
    SessionChecks(const Options& options, Desk& desk) : m_rOptions(options), m_rDesk(desk) {}

    SessionChecks(const SessionChecks&) = delete;
    SessionChecks& operator=(const SessionChecks&) = delete;

    /** Makes a session call the checks, which must outlive it. */
    void AddTo(SessionHooks& hooks);

    bool HaveFailed() const { return m_Failed; }

private:
    void ReportRefusal(std::size_t line, const std::string& reason);

    const Options& m_rOptions;
    Desk& m_rDesk;
    bool m_Failed = false;
};

} // namespace deskplayer

#endif

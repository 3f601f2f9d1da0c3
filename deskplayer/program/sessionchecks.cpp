#include "program/sessionchecks.h"

#include "program/failure.h"
#include "text/timetext.h"

namespace deskplayer
{

void SessionChecks::AddTo(SessionHooks& hooks)
{
    hooks.onRefused = [this](std::size_t line, const std::string& reason) {
        ReportRefusal(line, reason);
    };
}

void SessionChecks::ReportRefusal(std::size_t line, const std::string& reason)
{
    PrintMessage(m_rOptions.session + ":" + std::to_string(line) + ": refused at " +
                 TimeText(m_rDesk.Clock().Now()) + ": " + reason);
    m_Failed = m_Failed || m_rOptions.strict;
}

} // namespace deskplayer

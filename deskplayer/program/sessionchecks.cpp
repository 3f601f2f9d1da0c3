#include "program/sessionchecks.h"

#include <algorithm>

#include "program/failure.h"
#include "text/printable.h"
#include "text/timetext.h"

namespace deskplayer
{

SessionChecks::SessionChecks(const Options& options, const std::vector<ScriptStep>& steps,
                             Desk& desk)
    : m_rOptions(options), m_rDesk(desk)
{
    if (std::any_of(steps.begin(), steps.end(), IsExpectation)) {
        m_rDesk.Listeners().AddListener(&m_Recorder);
    }
}

void SessionChecks::AddTo(SessionHooks& hooks)
{
    hooks.beforeCommand = [this] { m_Recorder.Clear(); };
    hooks.onExpectation = [this](const ScriptStep& step) { CheckExpectation(step); };
    hooks.onRefused = [this](std::size_t line, const std::string& reason) {
        ReportRefusal(line, reason);
    };
}

void SessionChecks::CheckExpectation(const ScriptStep& step)
{
    std::string expected;
    for (const std::string& word : step.words) {
        expected += (expected.empty() ? "" : " ") + word;
    }
    const bool fulfilled =
        step.words.empty()
            ? m_Recorder.IsEmpty()
            : m_Recorder.Contains(step.words.front(), {step.words.begin() + 1, step.words.end()});
    if (!fulfilled) {
        Report(step.line, "expected " + (expected.empty() ? "nothing" : Printable(expected)) +
                              " by " + TimeText(m_rDesk.Clock().Now()) +
                              "; since the last command: " + m_Recorder.Text());
        m_Failed = true;
    }
}

void SessionChecks::Report(std::size_t line, const std::string& message) const
{
    PrintMessage(Printable(m_rOptions.session) + ":" + std::to_string(line) + ": " + message);
}

void SessionChecks::ReportRefusal(std::size_t line, const std::string& reason)
{
    Report(line, "refused at " + TimeText(m_rDesk.Clock().Now()) + ": " + reason);
    m_Failed = m_Failed || m_rOptions.strict;
}

} // namespace deskplayer

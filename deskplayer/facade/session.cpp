#include "deskplayer/session.h"

#include <algorithm>
#include <cstddef>
#include <utility>

#include "facade/parts.h"
#include "output/callbackrecorder.h"
#include "session/session.h"
#include "session/sessionfile.h"
#include "text/names.h"
#include "text/printable.h"
#include "text/timetext.h"

namespace deskplayer
{

/** What a session consists of once it was read. */
struct Session::Script {
    std::string name;
    std::vector<ScriptStep> steps;
};

namespace
{

/** Compares a session with what its author demands, while it is played. */
class Checks
{
public:
    /** Registers a listener at the desk if the session has expectations. */
    Checks(std::string name, const std::vector<ScriptStep>& steps, DeskParts& desk,
           const MessageHandler& onMessage)
        : m_Name(std::move(name)), m_rDesk(desk), m_rOnMessage(onMessage)
    {
        if (std::any_of(steps.begin(), steps.end(), IsExpectation)) {
            m_rDesk.Listeners().AddListener(&m_Recorder);
        }
    }

    ~Checks() { m_rDesk.Listeners().RemoveListener(&m_Recorder); }
    Checks(const Checks&) = delete;
    Checks& operator=(const Checks&) = delete;

    /** Hooks that call this object. */
    SessionHooks Hooks()
    {
        SessionHooks hooks;
        hooks.beforeCommand = [this] { m_Recorder.Clear(); };
        hooks.onExpectation = [this](const ScriptStep& step) { CheckExpectation(step); };
        hooks.onRefused = [this](std::size_t line, const std::string& reason) {
            Report(m_Report.refused, line, "refused at " + Now() + ": " + reason);
        };
        return hooks;
    }

    SessionReport TakeReport() { return std::move(m_Report); }

private:
    void CheckExpectation(const ScriptStep& step)
    {
        std::string expected;
        for (const std::string& word : step.words) {
            expected += (expected.empty() ? "" : " ") + word;
        }
        const bool met = step.words.empty()
                             ? m_Recorder.IsEmpty()
                             : m_Recorder.Contains(step.words.front(),
                                                   {step.words.begin() + 1, step.words.end()});
        if (!met) {
            Report(m_Report.unmet, step.line,
                   "expected " + (expected.empty() ? "nothing" : Printable(expected)) + " by " +
                       Now() + "; since the last command: " + m_Recorder.Text());
        }
    }

    void Report(std::vector<std::string>& lines, std::size_t line, const std::string& message)
    {
        lines.push_back(m_Name + ":" + std::to_string(line) + ": " + message);
        if (m_rOnMessage) {
            m_rOnMessage(lines.back());
        }
    }

    std::string Now() const { return TimeText(m_rDesk.Clock().Now()); }

    const std::string m_Name; ///< printable
    DeskParts& m_rDesk;
    const MessageHandler& m_rOnMessage;
    CallbackRecorder m_Recorder;
    SessionReport m_Report;
};

} // namespace

Session::Session(std::string_view text, const std::string& name)
    : m_pScript(std::make_shared<const Script>(
          Script{name, ParseScript(text, name, CommandSyntaxes(), CallbackNames())}))
{
}

Session ReadSessionFile(const std::string& fileName)
{
    return Session(ReadSessionText(fileName), fileName);
}

SessionReport PlaySession(Desk& desk, const Session& session, const SessionOptions& options)
{
    const Session::Script& script = *session.m_pScript;
    Checks checks(Printable(script.name), script.steps, PartsOf(desk), options.onMessage);
    SessionHooks hooks = checks.Hooks();
    hooks.beforeTimePasses = options.beforeTimePasses;
    PlaySession(script.steps, PartsOf(desk), hooks,
                options.playOn ? SessionEnd::PlayOn : SessionEnd::Stay);
    return checks.TakeReport();
}

void PlayFromStartToEnd(Desk& desk, const TimeHandler& beforeTimePasses)
{
    SessionHooks hooks;
    hooks.beforeTimePasses = beforeTimePasses;
    PlayFromStartToEnd(PartsOf(desk), hooks);
}

} // namespace deskplayer

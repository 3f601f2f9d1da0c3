#include "session/session.h"

#include <algorithm>

namespace deskplayer
{

namespace
{

constexpr Ticks EndlessStillDuration = std::chrono::seconds(3);

/** Advances time change by change, so that a session in real time shows each when it happens. */
void Pass(Ticks time, DeskParts& desk, const SessionHooks& hooks)
{
    while (time > Ticks(0)) {
        const Ticks next = std::min(time, desk.Navigator().TimeToNextChange().value_or(time));
        if (hooks.beforeTimePasses) {
            hooks.beforeTimePasses(next);
        }
        // The clock also advances by the time left after playback has ended.
        desk.Clock().Advance(desk.Navigator().Advance(next));
        time -= next;
    }
}

void PassUntilNothingChanges(DeskParts& desk, const SessionHooks& hooks)
{
    while (!desk.Navigator().IsRepeating()) {
        const std::optional<Ticks> next = desk.Navigator().TimeToNextChange();
        if (!next) {
            return;
        }
        // A change that is due at once needs no time to pass.
        Pass(std::max(*next, Ticks(1)), desk, hooks);
    }
}

} // namespace

void PlaySession(const std::vector<ScriptStep>& steps, DeskParts& desk, const SessionHooks& hooks,
                 SessionEnd end)
{
    const Ticks start = desk.Clock().Now();
    for (const ScriptStep& step : steps) {
        Pass(start + step.time - desk.Clock().Now(), desk, hooks);
        if (IsExpectation(step)) {
            if (hooks.onExpectation) {
                hooks.onExpectation(step);
            }
            continue;
        }
        if (hooks.beforeCommand) {
            hooks.beforeCommand();
        }
        const Outcome outcome = Commands()[step.command].perform(desk, step.values);
        if (!outcome.IsDone() && hooks.onRefused) {
            hooks.onRefused(step.line, outcome.Reason());
        }
    }
    if (end == SessionEnd::PlayOn) {
        PassUntilNothingChanges(desk, hooks);
    }
}

void PlayFromStartToEnd(DeskParts& desk, const SessionHooks& hooks)
{
    desk.Navigator().Play();
    for (;;) {
        PassUntilNothingChanges(desk, hooks);
        if (desk.Navigator().CurrentStatus() != Status::Still) {
            return;
        }
        Pass(EndlessStillDuration, desk, hooks);
        desk.Navigator().LeaveStill();
    }
}

} // namespace deskplayer

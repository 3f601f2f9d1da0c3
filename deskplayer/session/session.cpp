#include "session/session.h"

#include <algorithm>

#include "disc/codes.h"

namespace deskplayer
{

namespace
{

constexpr std::uint64_t EndlessStillDuration = 3 * std::uint64_t{TicksPerSecond};

/** Lets time pass, change by change, so that a session in real time shows each when it happens. */
void Pass(std::uint64_t ticks, Desk& desk, VirtualClock& clock, const SessionHooks& hooks)
{
    while (ticks > 0) {
        const std::uint64_t next =
            std::min(ticks, desk.navigator.TimeToNextChange().value_or(ticks));
        if (hooks.beforeTimePasses) {
            hooks.beforeTimePasses(next);
        }
        // What is left when playback has ended passes all the same.
        clock.Advance(desk.navigator.Advance(next));
        ticks -= next;
    }
}

void PassWhileAnythingHappens(Desk& desk, VirtualClock& clock, const SessionHooks& hooks)
{
    while (!desk.navigator.IsRepeating()) {
        const std::optional<std::uint64_t> next = desk.navigator.TimeToNextChange();
        if (!next) {
            return;
        }
        // A change that is due at once needs no time to pass.
        Pass(std::max<std::uint64_t>(*next, 1), desk, clock, hooks);
    }
}

} // namespace

void PlaySession(const std::vector<ScriptStep>& steps, Desk& desk, VirtualClock& clock,
                 const SessionHooks& hooks)
{
    for (const ScriptStep& step : steps) {
        Pass(step.time - clock.Now(), desk, clock, hooks);
        const Outcome outcome = Commands()[step.command].perform(desk, step.values);
        if (!outcome.IsDone() && hooks.onRefused) {
            hooks.onRefused(step.line, outcome.Reason());
        }
    }
    PassWhileAnythingHappens(desk, clock, hooks);
}

void PlayFromStartToEnd(Desk& desk, VirtualClock& clock, const SessionHooks& hooks)
{
    desk.navigator.Play();
    for (;;) {
        PassWhileAnythingHappens(desk, clock, hooks);
        if (desk.navigator.CurrentStatus() != SimulatedNavigator::Status::Still) {
            return;
        }
        Pass(EndlessStillDuration, desk, clock, hooks);
        desk.navigator.LeaveStill();
    }
}

} // namespace deskplayer

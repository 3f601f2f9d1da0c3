#include "session/builtinsession.h"

#include "disc/codes.h"

namespace deskplayer
{

namespace
{

constexpr std::uint64_t PauseDuration = 2 * std::uint64_t{TicksPerSecond};
constexpr std::uint64_t EndlessStillDuration = 3 * std::uint64_t{TicksPerSecond};

} // namespace

void PlayBuiltInSession(SimulatedNavigator& navigator, std::uint64_t duration)
{
    navigator.Play();
    navigator.Advance(duration / 3);
    navigator.Pause();
    navigator.Advance(PauseDuration);
    navigator.Step();
    navigator.Continue();
    while (navigator.CurrentStatus() != SimulatedNavigator::Status::Finished) {
        if (const auto next = navigator.TimeToNextChange()) {
            navigator.Advance(*next);
        } else {
            navigator.Advance(EndlessStillDuration);
            navigator.EndStill();
        }
    }
}

} // namespace deskplayer

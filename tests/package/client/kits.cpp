// A test of a navigator, with the navigator kit, the client kit and the test kit.
#include "bdmvnavigator/navigatorevent.h"
#include "clientkit/playbackstatus.h"
#include "navigatorkit/eventqueue.h"
#include "testkit/bench.h"

int main()
{
    bdmv::StatusListener follower;
    bdmvtest::Bench bench{&follower};
    bdmv::EventQueue queue(1);
    const bool isPosted = queue.Post<bdmv::PausedEvent>(bench.context);
    queue.DispatchNext(bench.listeners);
    return isPosted && follower.Status().state.value == bdmv::PlaybackPaused ? 0 : 1;
}

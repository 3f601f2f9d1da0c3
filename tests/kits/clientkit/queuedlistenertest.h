/**
 * @file
 * A queue whose client records its callbacks and stays in each until the test lets it continue.
 */
#ifndef KITS_CLIENTKIT_QUEUEDLISTENERTEST_H
#define KITS_CLIENTKIT_QUEUEDLISTENERTEST_H

#include <gtest/gtest.h>

#include <cstddef>
#include <functional>
#include <string>
#include <thread>
#include <utility>

#include "callbackqueuebench.h"
#include "clientkit/queuedlistener.h"
#include "gate.h"
#include "testkit/fakeplatform.h"
#include "testkit/journal.h"
#include "testkit/recordinglistener.h"

namespace bdmvtest
{

/** Runs an action of the test in every callback. */
class ActingListener : public bdmv::CallbackListener
{
public:
    explicit ActingListener(std::function<void(const bdmv::Callback&)> action)
        : m_Action(std::move(action))
    {
    }

private:
    void OnCallback(const bdmv::Callback& callback) override { m_Action(callback); }

    std::function<void(const bdmv::Callback&)> m_Action;
};

/** Whether no callback waits or runs; a resync may. */
inline bool IsIdle(const bdmv::QueuedListener& queued)
{
    const bdmv::QueuedListener::Counters counters = queued.GetCounters();
    return counters.received == counters.delivered + counters.merged + counters.lost;
}

inline void WaitUntilIdle(const bdmv::QueuedListener& queued)
{
    while (!IsIdle(queued)) {
        std::this_thread::yield();
    }
}

class QueuedListenerTest : public ::testing::Test
{
protected:
    QueuedListenerTest()
    {
        client.onCallback = [this](const std::string&) { gate.Pass(); };
    }

    Journal journal;
    FakePlatform platform{&journal};
    Gate gate;
    RecordingListener client{journal, "client"};
};

} // namespace bdmvtest

#endif

/**
 * @file
 * A queue, and a client that takes from it when the test says so.
 */
#ifndef KITS_CLIENTKIT_CALLBACKQUEUEBENCH_H
#define KITS_CLIENTKIT_CALLBACKQUEUEBENCH_H

#include <cstddef>
#include <string>
#include <vector>

#include "clientkit/callbackqueue.h"
#include "testkit/fakeplatform.h"
#include "testkit/recordinglistener.h"

namespace bdmvtest
{

inline bdmv::QueuedListener::Options OptionsOf(std::size_t places, std::size_t largestBlock = 16)
{
    bdmv::QueuedListener::Options options;
    options.places = places;
    options.largestBlock = largestBlock;
    return options;
}

/** The client receives what it takes as text. */
class QueueBench
{
public:
    explicit QueueBench(std::size_t places, std::size_t largestBlock = 16)
        : queue(OptionsOf(places, largestBlock))
    {
    }

    void Put(const std::vector<bdmv::Callback>& all)
    {
        for (const bdmv::Callback& callback : all) {
            queue.Put(callback);
        }
    }

    /** What the client receives from one step: callbacks, or "resync: " and callbacks. */
    std::string TakeOne()
    {
        std::string text;
        bdmv::Callback callback = bdmv::callbacks::PlayStarted();
        bdmv::PlaybackStatus status;
        switch (queue.Take(callback, status)) {
        case bdmv::CallbackQueue::StepDeliver:
            Deliver(callback, m_Recorder);
            text = m_Journal.Take();
            break;
        case bdmv::CallbackQueue::StepResync:
            Deliver(status, m_Recorder);
            text = "resync\n" + m_Journal.Take();
            break;
        case bdmv::CallbackQueue::StepDiscard:
            text = "discarded\n";
            break;
        case bdmv::CallbackQueue::StepNone:
            text = "nothing\n";
            break;
        }
        queue.Finish();
        return text;
    }

    std::string TakeAll()
    {
        std::string text;
        while (!queue.IsEmpty()) {
            text += TakeOne();
        }
        return text;
    }

    bdmv::QueuedListener::Counters Counters() const { return queue.GetCounters(); }

    bdmv::CallbackQueue queue;

private:
    Journal m_Journal;
    RecordingListener m_Recorder{m_Journal, "client"};
};

} // namespace bdmvtest

#endif

// Queues of events between producers and a delivering thread: the queue of the navigator kit, and
// what is written instead of it, with `new` and `delete` of every event.

#include <atomic>
#include <condition_variable>
#include <deque>
#include <memory>
#include <mutex>
#include <stdexcept>
#include <string>
#include <thread>
#include <utility>

#include <benchmark/benchmark.h>
#include <boost/lockfree/queue.hpp>
#include <concurrentqueue/concurrentqueue.h>

#include "bdmvnavigator/navigatorevent.h"
#include "benchmarks.h"
#include "context.h"
#include "listener.h"
#include "navigatorkit/eventqueue.h"
#include "testkit/allocationcounter.h"

namespace bench
{

namespace
{

using bdmv::INavigatorEvent;
using Event = bdmv::PlayStartedEvent;
using List = INavigatorEvent::Listeners;

constexpr std::size_t Places = 1024;

// Each subject has Post() for any thread, and for the delivering thread DispatchNext(), which
// returns false when empty, and Run(), which returns after Close().

class KitQueue
{
public:
    void Post(Context& context)
    {
        if (!m_Queue.Post<Event>(context)) {
            throw std::runtime_error("bdmv::EventQueue refused an event");
        }
    }
    bool DispatchNext(List& listeners) { return m_Queue.DispatchNext(listeners); }
    void Run(List& listeners) { m_Queue.Run(listeners); }
    void Close() { m_Queue.Close(); }

private:
    bdmv::EventQueue m_Queue{Places};
};

class Deque
{
public:
    void Post(Context& context)
    {
        std::unique_ptr<INavigatorEvent> event = std::make_unique<Event>(context);
        {
            const std::lock_guard<std::mutex> lock(m_Mutex);
            m_Events.push_back(std::move(event));
        }
        m_Changed.notify_one();
    }

    bool DispatchNext(List& listeners)
    {
        std::unique_lock<std::mutex> lock(m_Mutex);
        if (m_Events.empty()) {
            return false;
        }
        DispatchFirst(listeners, lock);
        return true;
    }

    void Run(List& listeners)
    {
        for (;;) {
            std::unique_lock<std::mutex> lock(m_Mutex);
            m_Changed.wait(lock, [this] { return m_IsClosed || !m_Events.empty(); });
            if (m_Events.empty()) {
                return;
            }
            DispatchFirst(listeners, lock);
        }
    }

    void Close()
    {
        {
            const std::lock_guard<std::mutex> lock(m_Mutex);
            m_IsClosed = true;
        }
        m_Changed.notify_one();
    }

private:
    void DispatchFirst(List& listeners, std::unique_lock<std::mutex>& lock)
    {
        const std::unique_ptr<INavigatorEvent> event = std::move(m_Events.front());
        m_Events.pop_front();
        lock.unlock();
        event->Dispatch(listeners);
    }

    std::mutex m_Mutex;
    std::condition_variable m_Changed;
    std::deque<std::unique_ptr<INavigatorEvent>> m_Events;
    bool m_IsClosed = false;
};

/** What the queues of pointers share. They cannot wait, so the deliverer polls and yields. */
template <typename Pointers> class PointerQueue
{
public:
    void Post(Context& context) { m_Pointers.Push(new Event(context)); }

    bool DispatchNext(List& listeners)
    {
        INavigatorEvent* event = nullptr;
        if (!m_Pointers.Pop(event)) {
            return false;
        }
        event->Dispatch(listeners);
        delete event;
        return true;
    }

    void Run(List& listeners)
    {
        while (DispatchNext(listeners) || !m_IsClosed) {
            while (DispatchNext(listeners)) {
            }
            std::this_thread::yield();
        }
    }

    void Close() { m_IsClosed = true; }

private:
    Pointers m_Pointers;
    std::atomic<bool> m_IsClosed{false};
};

struct LockFreePointers {
    void Push(INavigatorEvent* event) { pointers.push(event); }
    bool Pop(INavigatorEvent*& event) { return pointers.pop(event); }

    boost::lockfree::queue<INavigatorEvent*> pointers{Places};
};

struct ConcurrentPointers {
    void Push(INavigatorEvent* event) { pointers.enqueue(event); }
    bool Pop(INavigatorEvent*& event) { return pointers.try_dequeue(token, event); }

    moodycamel::ConcurrentQueue<INavigatorEvent*> pointers{Places};
    moodycamel::ConsumerToken token{pointers};
};

/** Counts what was delivered; producers read the count. */
class DeliveryCounter final : public bdmv::NavigatorListenerAdapter
{
public:
    void PlayStarted() override
    {
        m_Count.store(m_Count.load(std::memory_order_relaxed) + 1, std::memory_order_release);
    }

    void WaitFor(unsigned count) const
    {
        while (m_Count.load(std::memory_order_acquire) < count) {
            std::this_thread::yield();
        }
    }

private:
    std::atomic<unsigned> m_Count{0};
};

/** A queue with its listener and, while it lives, a delivering thread. */
template <typename Queue> class Delivering
{
public:
    Delivering()
    {
        m_Listeners.AddListener(&m_Counter);
        m_Thread = std::thread([this] {
            const std::size_t before = bdmvtest::CountAllocations();
            m_Queue.Run(m_Listeners);
            m_Allocations = bdmvtest::CountAllocations() - before;
        });
    }

    ~Delivering() { End(); }

    Delivering(const Delivering&) = delete;
    Delivering& operator=(const Delivering&) = delete;

    void PostRound(unsigned producers, unsigned round)
    {
        for (unsigned i = 0; i < EventsARound / producers; ++i) {
            m_Queue.Post(m_Context);
        }
        m_Counter.WaitFor(round * EventsARound);
    }

    /** Ends the thread. @return the number of its allocations */
    std::size_t End()
    {
        if (m_Thread.joinable()) {
            m_Queue.Close();
            m_Thread.join();
        }
        return m_Allocations;
    }

private:
    Context m_Context;
    List m_Listeners;
    DeliveryCounter m_Counter;
    Queue m_Queue;
    std::size_t m_Allocations = 0;
    std::thread m_Thread;
};

template <typename Queue> void OneThread(benchmark::State& state)
{
    Context context;
    List listeners;
    listeners.AddListener(&Listeners()[0]);
    Queue queue;
    const std::size_t before = bdmvtest::CountAllocations();
    for (auto _ : state) {
        queue.Post(context);
        queue.DispatchNext(listeners);
    }
    state.counters[AllocationsCounter] = static_cast<double>(bdmvtest::CountAllocations() - before);
}

template <typename Queue> void Producers(benchmark::State& state)
{
    static std::unique_ptr<Delivering<Queue>> delivering;
    // The threads of a row meet before the first and after the last round.
    if (state.thread_index() == 0) {
        delivering = std::make_unique<Delivering<Queue>>();
    }
    unsigned round = 0;
    std::size_t allocations = bdmvtest::CountAllocations();
    for (auto _ : state) {
        delivering->PostRound(static_cast<unsigned>(state.threads()), ++round);
    }
    allocations = bdmvtest::CountAllocations() - allocations;
    if (state.thread_index() == 0) {
        allocations += delivering->End();
        delivering.reset();
    }
    state.counters[AllocationsCounter] = static_cast<double>(allocations);
}

template <typename Queue> void RegisterQueue(const char* name)
{
    for (const int producers : ProducerCounts) {
        const std::string row = QueueRow(name, producers);
        if (producers == 0) {
            benchmark::RegisterBenchmark(row.c_str(), OneThread<Queue>);
        } else {
            benchmark::RegisterBenchmark(row.c_str(), Producers<Queue>)
                ->Threads(producers)
                ->UseRealTime();
        }
    }
}

} // namespace

void RegisterQueues()
{
    RegisterQueue<Deque>(DequeName);
    RegisterQueue<PointerQueue<LockFreePointers>>(LockFreeName);
    RegisterQueue<PointerQueue<ConcurrentPointers>>(ConcurrentName);
    RegisterQueue<KitQueue>(QueueName);
}

} // namespace bench

/**
 * @file
 * The queue between the threads on which things happen and the thread that delivers events.
 *
 * @code
 * bdmv::EventQueue queue(256);
 *
 * // where playback pauses, on any thread
 * if (!queue.Post<bdmv::PausedEvent>(context)) {
 *     ReportLostEvent(); // the queue is full or closed
 * }
 *
 * // the delivering thread
 * queue.Run(listeners);
 *
 * // at the end of playback: Run() delivers the events that are left, then returns
 * queue.Close();
 * @endcode
 *
 * Memory. The constructor allocates all places at once. Post() constructs an event in a free place,
 * and the event stays there until it has been dispatched, so nothing else allocates. A full queue
 * refuses, and the event is lost unless the caller of Post() acts: choose the number of places for
 * the longest burst, check the result, and watch Counters::refused.
 *
 * Order. First in, first out over all producers. An event is posted at the end of its Post(), after
 * its constructor: of two that overlap, either may be first.
 *
 * Lifetime. What an event refers to, above all its playback context, must outlive its delivery. An
 * event is destroyed at the end of its delivery, or undelivered by the destructor of the queue.
 *
 * Threads. Any number of threads may post. Only one thread at a time may be in DispatchNext() or
 * Run(); a thread that takes over must synchronise with its predecessor. What a producer did before
 * Post() is visible to the callbacks of its event. No lock is held while a constructor, a callback
 * or a destructor runs, so each of them may call Post(), Close() and GetCounters(). They must not
 * dispatch: DispatchNext() and Run() throw there.
 *
 * Locking. Most calls of Post() and DispatchNext() take no lock. A Post() that meets another one
 * lets it go first for about a microsecond. The queue's mutex is taken by a Post() that wakes
 * Run(), raises Counters::mostAtOnce or is refused, by one whose constructor throws and by one that
 * uses the place this leaves; by the deliverer before it blocks, and each time it has dispatched as
 * many events as there are places; by Close(); and by GetCounters(). All hold it for a few
 * instructions, except GetCounters(), which counts the queued events under it.
 *
 * Exceptions. What a callback throws leaves DispatchNext() and Run() after the event has been
 * destroyed; the next call continues with the next event. What a constructor throws leaves Post(),
 * which then has posted nothing.
 */
#ifndef NAVIGATORKIT_EVENTQUEUE_H
#define NAVIGATORKIT_EVENTQUEUE_H

#include <atomic>
#include <condition_variable>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <mutex>
#include <new>
#include <type_traits>
#include <utility>

#include "bdmvnavigator/inavigatorevent.h"

namespace bdmv
{

/** A queue of events with a fixed number of places. */
class EventQueue
{
public:
    /** The most places that a queue can have. */
    static const std::size_t MostPlaces = std::size_t(1) << 24;

    /** The size of a place in bytes; every event of the library fits. */
    static const std::size_t LargestEvent = 48;

    /** All counts are from construction on. */
    struct Counters {
        std::uint64_t posted;     ///< calls of Post() that returned true
        std::uint64_t dispatched; ///< events delivered, including those whose callback threw
        std::uint64_t refused;    ///< calls of Post() that returned false
        /**
         * The most events in the queue, including the one being dispatched. Exact with one thread;
         * otherwise never too low and never above the number of places, but events that were
         * dispatched during a Post() may be included.
         */
        std::size_t mostAtOnce;
    };

    /**
     * Allocates the places.
     *
     * @param places the events that fit; the one being dispatched keeps its place
     * @throw std::invalid_argument @p places is 0 or more than MostPlaces
     * @throw std::bad_alloc out of memory
     */
    explicit EventQueue(std::size_t places);

    /** Destroys the events left, undelivered. No other thread may be using the queue. */
    ~EventQueue();

    EventQueue(const EventQueue&) = delete;
    EventQueue& operator=(const EventQueue&) = delete;

    /**
     * Constructs an event at the end of the queue. Any thread, also inside a callback. Allocates
     * nothing and never waits for a place; when it takes the lock, see above. A thread blocked in
     * Run() is woken.
     *
     * @tparam Event a class derived from INavigatorEvent that fits in a place
     * @param arguments those of the event's constructor
     * @return false, and nothing is constructed, if the queue is full or closed: the event is lost
     * @throw whatever the constructor throws; the queue is as before
     */
    template <typename Event, typename... Arguments> bool Post(Arguments&&... arguments)
    {
        static_assert(std::is_convertible<Event*, INavigatorEvent*>::value,
                      "the queue delivers classes derived from INavigatorEvent");
        static_assert(sizeof(Event) <= LargestEvent,
                      "the event does not fit in a place of the queue");
        static_assert(alignof(Event) <= alignof(std::max_align_t),
                      "the event does not fit in a place of the queue");
        const PlaceNumber place = TakePlace();
        if (place == NoPlace) {
            return false;
        }
        INavigatorEvent* event = nullptr;
        try {
            event = ::new (static_cast<void*>(&m_pPlaces[place].storage))
                Event(std::forward<Arguments>(arguments)...);
        } catch (...) {
            ReturnUnused(place);
            throw;
        }
        Append(place, event);
        return true;
    }

    /**
     * Delivers the first event and destroys it. Never waits for an event.
     *
     * @return false if the queue is empty
     * @throw std::system_error std::errc::resource_deadlock_would_occur when called while this
     *        queue is delivering an event; nothing is taken
     * @throw whatever INavigatorEvent::Dispatch() throws; the event has been destroyed
     */
    bool DispatchNext(INavigatorEvent::Listeners& listeners);

    /**
     * Delivers events, and waits for more, until the queue is closed and empty. It yields the
     * processor a hundred times before it blocks on the operating system's condition variable. An
     * event whose Post() began before Close() is still delivered.
     *
     * @throw as DispatchNext(); call it again to continue
     */
    void Run(INavigatorEvent::Listeners& listeners);

    /** Makes Post() refuse from now on, and Run() return when the queue is empty. Any thread. */
    void Close();

    /**
     * Any thread. Allocates nothing. Takes time proportional to the number of events in the queue,
     * and holds the lock meanwhile. While other threads use the queue, the counts may be of
     * slightly different moments, but `dispatched` is never more than `posted`.
     */
    Counters GetCounters() const;

private:
    typedef std::uint32_t PlaceNumber;
    typedef std::uint32_t Position; ///< in the order of dispatch; see eventqueue.cpp

    /** The storage of an event, and the entry of a position, which belongs to any event. */
    struct Place {
        std::atomic<Position> entry;
        PlaceNumber nextSpare;
        INavigatorEvent* event;
        std::aligned_storage<LargestEvent, alignof(std::max_align_t)>::type storage;
    };

    class Delivery;

    PlaceNumber TakePlace();
    PlaceNumber TakeSparePlace();
    void ReturnUnused(PlaceNumber place);
    void Append(PlaceNumber place, INavigatorEvent* event);
    std::size_t CountBefore(Position end);
    Position SeeDispatched();
    void FreeFirst();
    bool WaitForEvent();
    bool HasEvent() const;
    bool IsFinished() const;

    Position Next(Position position) const;
    std::size_t Distance(Position from, Position to) const;
    std::atomic<Position>& EntryAt(Position position) const;
    bool IsPosted(Position position, Position entry) const;
    bool IsUnposted(Position position, Position entry) const;
    INavigatorEvent& EventOf(Position entry) const;

    static const PlaceNumber NoPlace = ~PlaceNumber(0);

    // What producers write, what the deliverer writes, and what both only read are on separate
    // cache lines.

    struct PostingSide {
        std::atomic<Position> taken; ///< the first whose place is not taken; its top bit: closed
        std::atomic<Position> end;   ///< the first without an event, or an earlier one
        std::atomic<Position> seenDispatched; ///< what producers last read of the other side
        std::atomic<std::uint32_t> mostAtOnce;
        std::atomic<bool> isDelivererWaiting;
        unsigned char apart[64];
    } m_Posting;

    struct DeliveringSide {
        std::atomic<Position> dispatched; ///< the first not dispatched
        bool isDelivering;
        unsigned char apart[64];
    } m_Delivering;

    const std::uint32_t m_NumberOfPlaces;
    const unsigned m_LapShift;   ///< a position is a lap, shifted, and the number of an entry
    const Position m_NumberMask; ///< the bits of the number
    const std::unique_ptr<unsigned char[]> m_Memory;
    Place* const m_pPlaces;

    mutable std::mutex m_Mutex; ///< guards the members below
    std::condition_variable m_Changed;
    PlaceNumber m_FirstSpare;
    std::uint32_t m_NumberOfSpares;
    std::uint64_t m_DispatchedInLaps; ///< events of the laps that are complete
    std::uint64_t m_Refused;
};

} // namespace bdmv

#endif

// How it works. Every event gets a position in the order of dispatch. The entry of a position names
// the place whose storage holds the event. There are as many entries as places, so positions use
// them in turn, lap after lap.
//
//   position   a lap and the number of an entry
//   entry      a lap and the number of a place: the position of that lap has its event there
//
// Places are freed in the order of positions. So an entry also says which place is free one lap
// later, and needs no change when it becomes free:
//
//   1. Post() takes the place that the entry of position `taken` names, and advances `taken`.
//   2. It constructs the event there.
//   3. It writes the lap and the place into the first entry that still has the lap before. Only now
//      is the event in the queue: a constructor that is slow or throws holds up no other event, and
//      no event waits for a producer that was interrupted halfway.
//   4. The deliverer reads the entry of position `dispatched`, delivers, and advances `dispatched`.
//
// Steps 1 and 3 are an atomic instruction each and step 4 needs none; a lock would take two and one
// more each time the deliverer and a producer meet. Neither allocates, and entries have 32 bits,
// because not every processor has larger atomic types.
//
// A place whose event was not constructed cannot go back to the entries, which are in the order of
// dispatch. It becomes a spare, used when no entry offers a place. `taken` is ahead by the spares.
//
// Positions repeat after 2^31 events if the number of places is a power of two, with other numbers
// earlier, but never before 2^30. A producer that is suspended between two instructions while the
// others post that many events or a multiple, give or take a lap, can mistake an old position for a
// new one, and then the queue is corrupt. At a million events a second that takes more than 17
// minutes; nothing guards against it. A producer that is suspended for any other time does no harm.

#include "navigatorkit/eventqueue.h"

#include <algorithm>
#include <stdexcept>
#include <system_error>
#include <thread>

namespace bdmv
{

namespace
{

const std::uint32_t ClosedBit = std::uint32_t(1) << 31;
const std::uint32_t PositionBits = ClosedBit - 1;
const std::size_t CacheLine = 64;

/** How often the deliverer yields before it blocks: waking a thread costs more than an event. */
const int YieldsBeforeBlocking = 100;

/** How long a producer gives way; below a thousand the benchmarks show little of it. */
const int TurnsOfGivingWay = 2048;

/** The number of bits that the number of an entry takes. */
unsigned NumberBits(std::size_t places)
{
    if (places == 0 || places > EventQueue::MostPlaces) {
        throw std::invalid_argument("bdmv::EventQueue: number of places");
    }
    unsigned bits = 0;
    while ((std::size_t(1) << bits) < places) {
        ++bits;
    }
    return bits;
}

/**
 * Lets the producer that was first post a dozen events undisturbed: two that alternate fetch each
 * other's cache lines with every event, which takes longer than the event. A loop of about a
 * microsecond, because a thread that yields may not run again for a whole time slice.
 */
void GiveWay()
{
    for (int turn = 0; turn < TurnsOfGivingWay; ++turn) {
        std::atomic_signal_fence(std::memory_order_seq_cst); // keeps the loop
    }
}

} // namespace

const std::size_t EventQueue::MostPlaces;
const std::size_t EventQueue::LargestEvent;
const EventQueue::PlaceNumber EventQueue::NoPlace;

/** While it lives, an event is being delivered; then it is destroyed and its place is free. */
class EventQueue::Delivery
{
public:
    Delivery(EventQueue& queue, INavigatorEvent& event) : m_rQueue(queue), m_rEvent(event)
    {
        m_rQueue.m_Delivering.isDelivering = true;
    }

    ~Delivery()
    {
        m_rEvent.~INavigatorEvent();
        m_rQueue.FreeFirst();
        m_rQueue.m_Delivering.isDelivering = false;
    }

    Delivery(const Delivery&) = delete;
    Delivery& operator=(const Delivery&) = delete;

private:
    EventQueue& m_rQueue;
    INavigatorEvent& m_rEvent;
};

EventQueue::EventQueue(std::size_t places)
    : m_Posting(), m_Delivering(), m_NumberOfPlaces(static_cast<std::uint32_t>(places)),
      m_LapShift(NumberBits(places)), m_NumberMask((Position(1) << m_LapShift) - 1),
      m_Memory(new unsigned char[places * sizeof(Place) + CacheLine]),
      m_pPlaces(reinterpret_cast<Place*>(
          m_Memory.get() +
          (CacheLine - reinterpret_cast<std::uintptr_t>(m_Memory.get()) % CacheLine))),
      m_FirstSpare(NoPlace), m_NumberOfSpares(0), m_DispatchedInLaps(0), m_Refused(0)
{
    const Position lapBeforeTheFirst = (0 - (m_NumberMask + 1)) & PositionBits;
    for (PlaceNumber number = 0; number < m_NumberOfPlaces; ++number) {
        auto* const place = ::new (static_cast<void*>(m_pPlaces + number)) Place;
        place->entry.store(lapBeforeTheFirst | number, std::memory_order_relaxed);
    }
}

EventQueue::~EventQueue()
{
    while (HasEvent()) {
        const Position first = m_Delivering.dispatched.load(std::memory_order_relaxed);
        EventOf(EntryAt(first).load(std::memory_order_relaxed)).~INavigatorEvent();
        FreeFirst();
    }
}

bool EventQueue::DispatchNext(INavigatorEvent::Listeners& listeners)
{
    if (m_Delivering.isDelivering) {
        throw std::system_error(std::make_error_code(std::errc::resource_deadlock_would_occur),
                                "bdmv::EventQueue: it is delivering an event already");
    }
    const Position first = m_Delivering.dispatched.load(std::memory_order_relaxed);
    const Position entry = EntryAt(first).load(std::memory_order_acquire);
    if (!IsPosted(first, entry)) {
        return false;
    }
    INavigatorEvent& event = EventOf(entry);
    const Delivery delivery(*this, event);
    event.Dispatch(listeners);
    return true;
}

void EventQueue::Run(INavigatorEvent::Listeners& listeners)
{
    do {
        while (DispatchNext(listeners)) {
        }
    } while (WaitForEvent());
}

void EventQueue::Close()
{
    const std::lock_guard<std::mutex> lock(m_Mutex);
    m_Posting.taken.fetch_or(ClosedBit);
    m_Changed.notify_one();
}

EventQueue::Counters EventQueue::GetCounters() const
{
    const std::lock_guard<std::mutex> lock(m_Mutex);
    Position position = m_Delivering.dispatched.load(std::memory_order_acquire);
    Counters counters;
    counters.dispatched = m_DispatchedInLaps + (position & m_NumberMask);
    counters.posted = counters.dispatched;
    for (; !IsUnposted(position, EntryAt(position).load()); position = Next(position)) {
        ++counters.posted;
    }
    counters.refused = m_Refused;
    counters.mostAtOnce = m_Posting.mostAtOnce.load(std::memory_order_relaxed);
    return counters;
}

/** @return NoPlace, and counts the refusal, if there is none or the queue is closed */
EventQueue::PlaceNumber EventQueue::TakePlace()
{
    Position taken = m_Posting.taken.load(std::memory_order_acquire);
    for (;;) {
        if ((taken & ClosedBit) != 0) {
            return TakeSparePlace();
        }
        // What a producer saw before is enough as long as it leaves a place: looking at what the
        // deliverer writes with every event would slow both down. A full queue is exactly its
        // number of places ahead. Any other distance means that a place is free, or that `taken`
        // has changed since it was read: then the exchange fails, even if `dispatched` is past it.
        const Position seen = m_Posting.seenDispatched.load(std::memory_order_acquire);
        if (Distance(seen, taken) >= m_NumberOfPlaces &&
            Distance(SeeDispatched(), taken) == m_NumberOfPlaces) {
            return TakeSparePlace();
        }
        const Position entry = EntryAt(taken).load(std::memory_order_relaxed);
        if (m_Posting.taken.compare_exchange_strong(taken, Next(taken), std::memory_order_acq_rel,
                                                    std::memory_order_relaxed)) {
            return entry & m_NumberMask;
        }
        GiveWay();
        taken = m_Posting.taken.load(std::memory_order_acquire);
    }
}

EventQueue::PlaceNumber EventQueue::TakeSparePlace()
{
    const std::lock_guard<std::mutex> lock(m_Mutex);
    const bool isClosed = (m_Posting.taken.load(std::memory_order_relaxed) & ClosedBit) != 0;
    if (isClosed || m_NumberOfSpares == 0) {
        ++m_Refused;
        return NoPlace;
    }
    const PlaceNumber place = m_FirstSpare;
    m_FirstSpare = m_pPlaces[place].nextSpare;
    --m_NumberOfSpares;
    return place;
}

/** Makes a place a spare. */
void EventQueue::ReturnUnused(PlaceNumber place)
{
    const std::lock_guard<std::mutex> lock(m_Mutex);
    m_pPlaces[place].nextSpare = m_FirstSpare;
    m_FirstSpare = place;
    ++m_NumberOfSpares;
    // Run() of a closed queue may be waiting for this event.
    m_Changed.notify_one();
}

/** Posts the event that has been constructed in a place. */
void EventQueue::Append(PlaceNumber place, INavigatorEvent* event)
{
    m_pPlaces[place].event = event;
    Position end = m_Posting.end.load(std::memory_order_acquire);
    std::size_t before = 0;
    for (;;) {
        before = CountBefore(end);
        Position entry = EntryAt(end).load(std::memory_order_acquire);
        if (!IsUnposted(end, entry)) {
            // A producer that was interrupted before it stored `end` moves it back, perhaps by many
            // laps. The entry has the last one, so the search takes no more than a lap.
            end = Next((entry & ~m_NumberMask) | (end & m_NumberMask));
        } else if (EntryAt(end).compare_exchange_strong(entry, (end & ~m_NumberMask) | place)) {
            break;
        }
    }
    m_Posting.end.store(Next(end), std::memory_order_release);

    // The deliverer says that it waits and then looks at the entry; here the order is the reverse.
    // So one of the two sees what the other wrote, and no event is left while the deliverer waits.
    // What was dispatched since `before` was read makes the new maximum too high, never too low.
    if (m_Posting.isDelivererWaiting.load() ||
        before >= m_Posting.mostAtOnce.load(std::memory_order_relaxed)) {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        m_Posting.isDelivererWaiting.store(false);
        m_Changed.notify_one();
        m_Posting.mostAtOnce.store(
            std::max(m_Posting.mostAtOnce.load(), static_cast<std::uint32_t>(before + 1)));
    }
}

/**
 * The events that are not dispatched before a position. Looks at what the deliverer writes only if
 * there may be more than ever before.
 */
std::size_t EventQueue::CountBefore(Position end)
{
    const std::size_t seen =
        Distance(m_Posting.seenDispatched.load(std::memory_order_acquire), end);
    if (seen < m_Posting.mostAtOnce.load(std::memory_order_relaxed)) {
        return seen;
    }
    return Distance(SeeDispatched(), end);
}

/** Reads what the deliverer writes, and publishes it to the other producers. */
EventQueue::Position EventQueue::SeeDispatched()
{
    const Position dispatched = m_Delivering.dispatched.load(std::memory_order_acquire);
    m_Posting.seenDispatched.store(dispatched, std::memory_order_release);
    return dispatched;
}

/** Frees the place of the first event, which counts as dispatched from now on. */
void EventQueue::FreeFirst()
{
    const Position next = Next(m_Delivering.dispatched.load(std::memory_order_relaxed));
    if ((next & m_NumberMask) != 0) {
        m_Delivering.dispatched.store(next, std::memory_order_release);
        return;
    }
    // Once a lap the count, which has more bits than a position, is brought up to date.
    const std::lock_guard<std::mutex> lock(m_Mutex);
    m_DispatchedInLaps += m_NumberOfPlaces;
    m_Delivering.dispatched.store(next, std::memory_order_release);
}

/** @return false if the queue is closed and empty */
bool EventQueue::WaitForEvent()
{
    for (int yields = 0; yields < YieldsBeforeBlocking; ++yields) {
        if (HasEvent()) {
            return true;
        }
        std::this_thread::yield();
    }
    std::unique_lock<std::mutex> lock(m_Mutex);
    m_Posting.isDelivererWaiting.store(true);
    while (!HasEvent() && !IsFinished()) {
        m_Changed.wait(lock);
        m_Posting.isDelivererWaiting.store(true);
    }
    m_Posting.isDelivererWaiting.store(false);
    return HasEvent();
}

bool EventQueue::HasEvent() const
{
    const Position first = m_Delivering.dispatched.load(std::memory_order_relaxed);
    return IsPosted(first, EntryAt(first).load());
}

/** Whether the queue is closed and every place is free or a spare: none is being filled. */
bool EventQueue::IsFinished() const
{
    const Position taken = m_Posting.taken.load();
    const Position dispatched = m_Delivering.dispatched.load(std::memory_order_relaxed);
    return (taken & ClosedBit) != 0 &&
           Distance(dispatched, taken & PositionBits) == m_NumberOfSpares;
}

EventQueue::Position EventQueue::Next(Position position) const
{
    const bool isLastOfLap = (position & m_NumberMask) == m_NumberOfPlaces - 1;
    return ((isLastOfLap ? position | m_NumberMask : position) + 1) & PositionBits;
}

/** The number of positions from one to a later one. */
std::size_t EventQueue::Distance(Position from, Position to) const
{
    const Position laps =
        (((to & ~m_NumberMask) - (from & ~m_NumberMask)) & PositionBits) >> m_LapShift;
    return std::size_t(laps) * m_NumberOfPlaces + (to & m_NumberMask) - (from & m_NumberMask);
}

std::atomic<EventQueue::Position>& EventQueue::EntryAt(Position position) const
{
    return m_pPlaces[position & m_NumberMask].entry;
}

/** Whether the entry has the lap of the position. */
bool EventQueue::IsPosted(Position position, Position entry) const
{
    return ((position ^ entry) & ~m_NumberMask) == 0;
}

/** Whether the entry has the lap before that of the position. */
bool EventQueue::IsUnposted(Position position, Position entry) const
{
    return IsPosted((position - (m_NumberMask + 1)) & PositionBits, entry);
}

INavigatorEvent& EventQueue::EventOf(Position entry) const
{
    return *m_pPlaces[entry & m_NumberMask].event;
}

} // namespace bdmv

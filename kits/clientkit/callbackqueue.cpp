#include "clientkit/callbackqueue.h"

#include <stdexcept>

namespace bdmv
{

namespace
{

/** Largest blocks that can wait at once. Standby comes rarely, and its blocks are mostly small. */
constexpr std::size_t LargestBlocks = 4;

/** What a place holds that is not in use: nothing to release. */
const callbacks::PlayStarted Unused = {};

std::size_t CheckedPlaces(std::size_t places)
{
    if (places == 0) {
        throw std::invalid_argument("bdmv::QueuedListener: no places");
    }
    return places;
}

} // namespace

CallbackQueue::CallbackQueue(const QueuedListener::Options& options)
    : m_Places(CheckedPlaces(options.places), Unused), m_First(0), m_Waiting(0), m_LostLater(0),
      m_Resync(false), m_AfterResync(0), m_Blocks(LargestBlocks, options.largestBlock),
      m_Taken(StepNone), m_TakenBlock(), m_Counters()
{
}

void CallbackQueue::Put(const Callback& callback)
{
    ++m_Counters.received;
    if (!Merge(callback) && !Append(callback)) {
        Lose();
    }
    Apply(callback, m_Status);
}

void CallbackQueue::Refuse()
{
    ++m_Counters.received;
    ++m_Counters.lost;
}

void CallbackQueue::LoseAll()
{
    m_Counters.lost += m_Waiting + m_AfterResync;
    m_LostLater += m_Waiting + m_AfterResync;
    m_Waiting = 0;
    m_AfterResync = 0;
    m_Resync = false;
    if (m_Taken == StepResync) {
        m_Taken = StepNone;
    }
}

CallbackQueue::Step CallbackQueue::Take(Callback& callback, PlaybackStatus& status)
{
    m_Taken = NextStep();
    if (m_Taken == StepDeliver) {
        --m_Waiting;
        TakeOldest(callback);
    } else if (m_Taken == StepDiscard) {
        --m_LostLater;
        TakeOldest(callback);
    } else if (m_Taken == StepResync) {
        status = m_AfterResync > 0 ? m_ResyncStatus : m_Status;
        m_Resync = false;
        m_Waiting = m_AfterResync;
        m_AfterResync = 0;
    }
    return m_Taken;
}

void CallbackQueue::Finish()
{
    m_Counters.delivered += m_Taken == StepDeliver ? 1 : 0;
    m_Counters.resyncs += m_Taken == StepResync ? 1 : 0;
    if (m_TakenBlock.data != nullptr) {
        m_Blocks.Remove(m_TakenBlock.data, m_TakenBlock.size);
        m_TakenBlock.data = nullptr;
    }
}

CallbackQueue::Step CallbackQueue::NextStep() const
{
    if (m_Waiting > 0) {
        return StepDeliver;
    }
    if (m_LostLater > 0) {
        return StepDiscard;
    }
    return m_Resync ? StepResync : StepNone;
}

void CallbackQueue::TakeOldest(Callback& callback)
{
    Callback& oldest = m_Places[m_First];
    callback = oldest;
    oldest = Unused; // not the last to share a program
    m_First = PlaceAt(1);
    if (const auto* const standby = callback.As<callbacks::SystemSuspended>()) {
        m_TakenBlock = *standby;
    }
}

std::size_t CallbackQueue::PlaceAt(std::size_t index) const
{
    const std::size_t place = m_First + index;
    return place < m_Places.size() ? place : place - m_Places.size();
}

bool CallbackQueue::Merge(const Callback& callback)
{
    if (callback.Id() != CallbackCurrentTimePosition || NewestPart() == 0) {
        return false;
    }
    Callback& newest = m_Places[PlaceAt(Used() - 1)];
    if (newest.Id() != CallbackCurrentTimePosition) {
        return false;
    }
    newest = callback;
    ++m_Counters.merged;
    return true;
}

bool CallbackQueue::Append(const Callback& callback)
{
    if (Used() == m_Places.size()) {
        return false;
    }
    Callback& place = m_Places[PlaceAt(Used())];
    const auto* const standby = callback.As<callbacks::SystemSuspended>();
    if (standby == nullptr) {
        place = callback;
    } else if (!AppendStandby(*standby, place)) {
        return false;
    }
    if (m_Resync && m_AfterResync == 0) {
        m_ResyncStatus = m_Status; // which does not include this callback yet
    }
    ++NewestPart();
    return true;
}

bool CallbackQueue::AppendStandby(const callbacks::SystemSuspended& standby, Callback& place)
{
    callbacks::SystemSuspended copy = {nullptr, standby.size};
    if (standby.data != nullptr && standby.size > 0) {
        copy.data = m_Blocks.Add(standby.data, standby.size);
        if (copy.data == nullptr) {
            return false;
        }
    }
    place = copy;
    return true;
}

void CallbackQueue::Lose()
{
    m_Counters.lost += m_AfterResync + 1;
    m_LostLater += m_AfterResync;
    m_AfterResync = 0;
    m_Resync = true;
}

} // namespace bdmv

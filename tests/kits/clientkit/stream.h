/**
 * @file
 * What a client behind a queue has received, checked against the stream that the queue received.
 */
#ifndef KITS_CLIENTKIT_STREAM_H
#define KITS_CLIENTKIT_STREAM_H

#include <gtest/gtest.h>

#include <cstddef>
#include <utility>
#include <vector>

#include "clientkit/callback.h"
#include "clientkit/playbackstatus.h"

namespace bdmvtest
{

/** Callbacks, and the status after each number of them. */
class Stream
{
public:
    /** @param callbacks of the positions, no two may be equal */
    explicit Stream(std::vector<bdmv::Callback> callbacks) : m_Callbacks(std::move(callbacks))
    {
        m_Statuses.resize(m_Callbacks.size() + 1);
        for (std::size_t i = 0; i < m_Callbacks.size(); ++i) {
            m_Statuses[i + 1] = m_Statuses[i];
            Apply(m_Callbacks[i], m_Statuses[i + 1]);
        }
    }

    std::size_t Size() const { return m_Callbacks.size(); }
    const bdmv::Callback& operator[](std::size_t index) const { return m_Callbacks[index]; }

    /** The status after the first callbacks. */
    const bdmv::PlaybackStatus& StatusAfter(std::size_t count) const { return m_Statuses[count]; }

private:
    std::vector<bdmv::Callback> m_Callbacks;
    std::vector<bdmv::PlaybackStatus> m_Statuses;
};

/**
 * Follows what a client receives. At every moment, the client is at a place of the stream: it has
 * received the callbacks before that place, or what stands for them.
 */
class Follower
{
public:
    explicit Follower(const Stream& stream) : m_rStream(stream) {}

    /** The client receives a callback of the stream: the next one, except for merged positions. */
    void Deliver(const bdmv::Callback& callback)
    {
        while (m_Place < m_rStream.Size() && m_rStream[m_Place] != callback) {
            ASSERT_TRUE(IsPosition(m_Place) && IsPosition(m_Place + 1))
                << NameOf(m_rStream[m_Place].Id()) << " is missing at " << m_Place;
            ++m_Place;
            ++merged;
        }
        ASSERT_LT(m_Place, m_rStream.Size()) << NameOf(callback.Id()) << " was not sent";
        ++m_Place;
        ++delivered;
        Apply(callback, m_Status);
        EXPECT_EQ(m_Status, m_rStream.StatusAfter(m_Place));
    }

    /** The client receives a callback of a resync. */
    void Repeat(const bdmv::Callback& callback) { Apply(callback, m_Status); }

    /** The client has received a resync, which stands for all up to the last loss. */
    void EndResync(std::size_t lastLost)
    {
        EXPECT_LE(m_Place, lastLost) << "nothing was lost there";
        m_Place = lastLost + 1;
        ++resyncs;
        EXPECT_EQ(m_Status, m_rStream.StatusAfter(m_Place));
    }

    bool IsAtTheEnd() const { return m_Place == m_rStream.Size(); }

    std::size_t delivered = 0;
    std::size_t merged = 0;
    std::size_t resyncs = 0;

private:
    bool IsPosition(std::size_t place) const
    {
        return place < m_rStream.Size() &&
               m_rStream[place].Id() == bdmv::CallbackCurrentTimePosition;
    }

    const Stream& m_rStream;
    std::size_t m_Place = 0;
    bdmv::PlaybackStatus m_Status;
};

} // namespace bdmvtest

#endif

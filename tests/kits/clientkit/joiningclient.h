/**
 * @file
 * Clients of a relay that can be compared with each other.
 */
#ifndef KITS_CLIENTKIT_JOININGCLIENT_H
#define KITS_CLIENTKIT_JOININGCLIENT_H

#include <gtest/gtest.h>

#include <algorithm>
#include <memory>
#include <vector>

#include "clientkit/listenerrelay.h"

namespace bdmvtest
{

/** Follows the status and keeps the callbacks. */
class JoiningClient : public bdmv::CallbackListener
{
public:
    bdmv::PlaybackStatus status;
    std::vector<bdmv::Callback> received;

protected:
    void OnCallback(const bdmv::Callback& callback) override
    {
        received.push_back(callback);
        Apply(callback, status);
    }
};

/** A client that was there from the start, and one more for each prefix of the callbacks. */
class ClientsOfEveryPrefix
{
public:
    /** Makes the first client join, before any callback. */
    explicit ClientsOfEveryPrefix(bdmv::ListenerRelay& relay) : m_rRelay(relay)
    {
        m_rRelay.Join(m_First);
    }

    ~ClientsOfEveryPrefix()
    {
        m_rRelay.Leave(m_First);
        for (const Late& late : m_Late) {
            m_rRelay.Leave(*late.client);
        }
    }

    ClientsOfEveryPrefix(const ClientsOfEveryPrefix&) = delete;
    ClientsOfEveryPrefix& operator=(const ClientsOfEveryPrefix&) = delete;

    /** Makes a client join now. */
    void JoinLate()
    {
        m_Late.push_back({std::make_unique<JoiningClient>(), m_First.received.size(), 0});
        Late& late = m_Late.back();
        m_rRelay.Join(*late.client);
        late.reported = late.client->received.size();
        ASSERT_EQ(late.client->status, m_First.status) << "after " << late.prefix << " callbacks";
    }

    /** All have received the same since they joined, and have the same status. */
    void ExpectTheSame() const
    {
        for (const Late& late : m_Late) {
            const std::vector<bdmv::Callback>& received = late.client->received;
            ASSERT_TRUE(std::equal(
                received.begin() + static_cast<std::ptrdiff_t>(late.reported), received.end(),
                m_First.received.begin() + static_cast<std::ptrdiff_t>(late.prefix),
                m_First.received.end()))
                << "after " << late.prefix << " callbacks";
            ASSERT_EQ(late.client->status, m_First.status)
                << "after " << late.prefix << " callbacks";
        }
    }

    std::size_t Count() const { return m_Late.size(); }

private:
    struct Late {
        std::unique_ptr<JoiningClient> client;
        std::size_t prefix;   ///< callbacks before it joined
        std::size_t reported; ///< callbacks that brought it up to date
    };

    bdmv::ListenerRelay& m_rRelay;
    JoiningClient m_First;
    std::vector<Late> m_Late;
};

} // namespace bdmvtest

#endif

#include "clientkit/listenerrelay.h"

#include <algorithm>

#include "bd/guard.h"

namespace bdmv
{

bool ListenerRelay::Join(INavigatorListener& client)
{
    const bd::Guard<bd::ThreadMutex> guard(m_ClientsLock);
    if (Find(client) != m_Clients.end()) {
        return false;
    }
    // Whatever can fail comes before the client belongs to the relay.
    m_Clients.reserve(m_Clients.size() + 1);
    Deliver(Status(), client);
    m_Clients.push_back(&client);
    return true;
}

bool ListenerRelay::Leave(INavigatorListener& client)
{
    const bd::Guard<bd::ThreadMutex> guard(m_ClientsLock);
    const Clients::iterator found = Find(client);
    if (found == m_Clients.end()) {
        return false;
    }
    m_Clients.erase(found);
    return true;
}

PlaybackStatus ListenerRelay::Status() const
{
    const bd::Guard<bd::ThreadMutex> guard(m_StatusLock);
    return m_Status;
}

void ListenerRelay::OnCallback(const Callback& callback)
{
    const bd::Guard<bd::ThreadMutex> guard(m_ClientsLock);
    Include(callback);
    for (INavigatorListener* const client : m_Clients) {
        Deliver(callback, *client);
    }
}

void ListenerRelay::Include(const Callback& callback)
{
    const bd::Guard<bd::ThreadMutex> guard(m_StatusLock);
    Apply(callback, m_Status);
}

ListenerRelay::Clients::iterator ListenerRelay::Find(INavigatorListener& client)
{
    return std::find(m_Clients.begin(), m_Clients.end(), &client);
}

} // namespace bdmv

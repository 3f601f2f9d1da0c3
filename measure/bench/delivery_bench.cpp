// Delivery by the library, by hand, and by the alternatives that a user might choose. Those call
// the listeners as their users would: without a virtual call, through the concrete class.

#include <mutex>

#include <boost/signals2/signal.hpp>
#include <sigc++/sigc++.h>

#include "benchmarks.h"
#include "delivery.h"
#include "subjects.h"

namespace bench
{

namespace
{

class BoostSignals
{
public:
    void Add(CountingListener& listener)
    {
        m_PlayStarted.connect([&listener] { listener.PlayStarted(); });
        m_CurrentTimePosition.connect([&listener](const bd::TimePosition& position) {
            listener.CurrentTimePosition(position);
        });
        m_AudioInfoChanged.connect([&listener](bool isPrimary, const bd::AudioInfoType& info) {
            listener.AudioInfoChanged(isPrimary, info);
        });
    }

    void PlayStarted() { m_PlayStarted(); }
    void CurrentTimePosition(const bd::TimePosition& position) { m_CurrentTimePosition(position); }
    void AudioInfoChanged(bool isPrimary, const bd::AudioInfoType& info)
    {
        m_AudioInfoChanged(isPrimary, info);
    }

private:
    boost::signals2::signal<void()> m_PlayStarted;
    boost::signals2::signal<void(const bd::TimePosition&)> m_CurrentTimePosition;
    boost::signals2::signal<void(bool, bd::AudioInfoType)> m_AudioInfoChanged;
};

class SigcSignals
{
public:
    void Add(CountingListener& listener)
    {
        m_PlayStarted.connect(sigc::mem_fun(listener, &CountingListener::PlayStarted));
        m_CurrentTimePosition.connect(
            sigc::mem_fun(listener, &CountingListener::CurrentTimePosition));
        m_AudioInfoChanged.connect(sigc::mem_fun(listener, &CountingListener::AudioInfoChanged));
    }

    void PlayStarted() { m_PlayStarted(); }
    void CurrentTimePosition(const bd::TimePosition& position) { m_CurrentTimePosition(position); }
    void AudioInfoChanged(bool isPrimary, const bd::AudioInfoType& info)
    {
        m_AudioInfoChanged(isPrimary, info);
    }

private:
    sigc::signal<void()> m_PlayStarted;
    sigc::signal<void(const bd::TimePosition&)> m_CurrentTimePosition;
    sigc::signal<void(bool, bd::AudioInfoType)> m_AudioInfoChanged;
};

/** Adds the mutex that a user needs around a subject that is not thread-safe. */
template <typename Subject> class Locked
{
public:
    void Add(CountingListener& listener) { m_Subject.Add(listener); }

    void PlayStarted()
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        m_Subject.PlayStarted();
    }

    void CurrentTimePosition(const bd::TimePosition& position)
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        m_Subject.CurrentTimePosition(position);
    }

    void AudioInfoChanged(bool isPrimary, const bd::AudioInfoType& info)
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        m_Subject.AudioInfoChanged(isPrimary, info);
    }

private:
    std::mutex m_Mutex;
    Subject m_Subject;
};

} // namespace

void RegisterDelivery()
{
    RegisterDelivery<Floor>(FloorName);
    RegisterDelivery<Library>(LibraryName);
    RegisterDelivery<BoostSignals>(BoostName);
    RegisterDelivery<SigcSignals>(SigcName);
    RegisterDelivery<Locked<SigcSignals>>(LockedSigcName);
    RegisterQtDelivery();
}

} // namespace bench

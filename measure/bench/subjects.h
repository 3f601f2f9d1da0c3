/**
 * @file
 * The floor, which no delivery under a lock can beat, and the library.
 *
 * A subject has Add() and, for each shape of callback, an operation that calls it on every listener
 * added.
 */
#ifndef BENCH_SUBJECTS_H
#define BENCH_SUBJECTS_H

#include <list>
#include <mutex>

#include "bd/eventlistenerlist.h"
#include "bdmvnavigator/inavigatorlistener.h"
#include "listener.h"

namespace bench
{

/** Written by hand: the system's mutex without a check of its owner, a list, a virtual call. */
class Floor
{
public:
    void Add(CountingListener& listener) { m_Listeners.push_back(&listener); }

    void PlayStarted()
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        for (bdmv::INavigatorListener* const listener : m_Listeners) {
            listener->PlayStarted();
        }
    }

    void CurrentTimePosition(const bd::TimePosition& position)
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        for (bdmv::INavigatorListener* const listener : m_Listeners) {
            listener->CurrentTimePosition(position);
        }
    }

    void AudioInfoChanged(bool isPrimary, const bd::AudioInfoType& info)
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        for (bdmv::INavigatorListener* const listener : m_Listeners) {
            listener->AudioInfoChanged(isPrimary, info);
        }
    }

private:
    std::mutex m_Mutex;
    std::list<bdmv::INavigatorListener*> m_Listeners;
};

/** The list of listeners and its firing functions. */
class Library
{
public:
    void Add(CountingListener& listener) { m_Listeners.AddListener(&listener); }

    void PlayStarted()
    {
        bd::EventListenerList_FireParam0(m_Listeners, &bdmv::INavigatorListener::PlayStarted);
    }

    void CurrentTimePosition(const bd::TimePosition& position)
    {
        bd::EventListenerList_FireParam1(m_Listeners,
                                         &bdmv::INavigatorListener::CurrentTimePosition, position);
    }

    void AudioInfoChanged(bool isPrimary, const bd::AudioInfoType& info)
    {
        bd::EventListenerList_FireParam2(m_Listeners, &bdmv::INavigatorListener::AudioInfoChanged,
                                         isPrimary, info);
    }

private:
    bd::EventListenerList<bdmv::INavigatorListener> m_Listeners;
};

} // namespace bench

#endif

/**
 * @file
 * An event that writes down what happens to it.
 */
#ifndef TESTS_KITS_NAVIGATORKIT_PROBEEVENT_H
#define TESTS_KITS_NAVIGATORKIT_PROBEEVENT_H

#include <functional>
#include <string>
#include <utility>
#include <vector>

#include "bdmvnavigator/inavigatorevent.h"

/** What happened to events, in order: "+1" constructed, "1" dispatched, "-1" destroyed. */
typedef std::vector<std::string> History;

/** Writes to a history; an action of the test may run while it is dispatched. */
class ProbeEvent : public bdmv::INavigatorEvent
{
public:
    typedef std::function<void()> Action;

    ProbeEvent(History& history, int number, Action whileDispatched = nullptr)
        : m_rHistory(history), m_Number(number),
          m_pWhileDispatched(new Action(std::move(whileDispatched)))
    {
        m_rHistory.push_back("+" + std::to_string(m_Number));
    }

    ~ProbeEvent() override
    {
        delete m_pWhileDispatched;
        m_rHistory.push_back("-" + std::to_string(m_Number));
    }

    ProbeEvent(const ProbeEvent&) = delete;
    ProbeEvent& operator=(const ProbeEvent&) = delete;

    void Dispatch(Listeners& /*listeners*/) override
    {
        m_rHistory.push_back(std::to_string(m_Number));
        if (*m_pWhileDispatched) {
            (*m_pWhileDispatched)();
        }
    }

private:
    History& m_rHistory;
    int m_Number;
    Action* m_pWhileDispatched; ///< a pointer, so that the event fits in a place
};

#endif

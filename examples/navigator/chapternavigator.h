/**
 * @file
 * A navigator that plays chapters: it changes its state, then delivers an event.
 */
#ifndef EXAMPLES_NAVIGATOR_CHAPTERNAVIGATOR_H
#define EXAMPLES_NAVIGATOR_CHAPTERNAVIGATOR_H

#include <stdexcept>

#include "bdmvnavigator/navigatorevent.h"
#include "chaptercontext.h"
#include "navigatorkit/eventqueue.h"

/**
 * Call all operations from one thread, which delivers the events before they return, and not inside
 * a callback, where the queue cannot deliver.
 */
class ChapterNavigator
{
public:
    /** The list in which clients register. */
    bdmv::INavigatorEvent::Listeners& Listeners() { return m_Listeners; }

    void Play() { Send<bdmv::PlayStartedEvent>(); }

    void GoToChapter(bd::ChapterNumberDef chapter)
    {
        if (!SEED_BUG) {
            m_Context.chapter = chapter;
            Send<bdmv::ChapterEvent>();
        } else {
            // An event reports what the context answers when it is delivered: here the old chapter.
            Send<bdmv::ChapterEvent>();
            m_Context.chapter = chapter;
        }
    }

    void SelectAudio(bd::StreamNumberDef number)
    {
        m_Context.audio = number;
        Send<bdmv::AudioInfoEvent>();
    }

private:
    template <typename Event> void Send()
    {
        if (!m_Queue.Post<Event>(m_Context)) {
            throw std::runtime_error("the event queue is full");
        }
        while (m_Queue.DispatchNext(m_Listeners)) {
        }
    }

    ChapterContext m_Context;
    bdmv::INavigatorEvent::Listeners m_Listeners;
    bdmv::EventQueue m_Queue{16};
};

#endif

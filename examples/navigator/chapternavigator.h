/**
 * @file
 * A navigator that plays chapters: it changes its state, then delivers an event.
 */
#ifndef EXAMPLES_NAVIGATOR_CHAPTERNAVIGATOR_H
#define EXAMPLES_NAVIGATOR_CHAPTERNAVIGATOR_H

#include "bdmvnavigator/navigatorevent.h"
#include "chaptercontext.h"
#include "navigatorkit/eventqueue.h"

/** Call all operations from one thread, which delivers the events before they return. */
class ChapterNavigator
{
public:
    /** The list in which clients register. */
    bdmv::INavigatorEvent::Listeners& Listeners() { return m_Listeners; }

    void Play() { Send<bdmv::PlayStartedEvent>(); }

    void GoToChapter(bd::ChapterNumberDef chapter)
    {
#if SEED_BUG
        // An event reports what the context answers when it is delivered: here the old chapter.
        Send<bdmv::ChapterEvent>();
        m_Context.chapter = chapter;
#else
        m_Context.chapter = chapter;
        Send<bdmv::ChapterEvent>();
#endif
    }

    void SelectAudio(bd::StreamNumberDef number)
    {
        m_Context.audio = number;
        Send<bdmv::AudioInfoEvent>();
    }

private:
    template <typename Event> void Send()
    {
        m_Queue.Post<Event>(m_Context);
        while (m_Queue.DispatchNext(m_Listeners)) {
        }
    }

    ChapterContext m_Context;
    bdmv::INavigatorEvent::Listeners m_Listeners;
    bdmv::EventQueue m_Queue{16};
};

#endif

#include "navigator/popupmenu.h"

#include <utility>

#include "bdmvnavigator/navigatorevent.h"
#include "navigator/buttonprogram.h"

namespace deskplayer
{

void PopUpMenu::Open()
{
    // Chapter numbers can have gaps, button numbers cannot.
    const Chapter* const chapter = m_rPlayhead.CurrentChapter();
    m_SelectedButton = 1;
    if (chapter != nullptr) {
        const Chapter* const first = m_rPlayhead.LoadedList().timeLine.chapters.data();
        m_SelectedButton =
            static_cast<bd::ButtonId>(m_rPlayhead.FindChapter(chapter->number) - first + 1);
    }
    m_Open = true;
    m_rSender.Send<bdmv::InteractiveGraphicsActiveEvent>();
    m_rSender.Send<bdmv::InteractiveGraphicsVisibleEvent>();
}

void PopUpMenu::Close()
{
    if (std::exchange(m_Open, false)) {
        m_rSender.Send<bdmv::InteractiveGraphicsInvisibleEvent>();
        m_rSender.Send<bdmv::InteractiveGraphicsInactiveEvent>();
    }
}

std::size_t PopUpMenu::NumberOfButtons() const
{
    return m_rPlayhead.LoadedList().timeLine.chapters.size();
}

const Chapter& PopUpMenu::ExecuteSelectedButton()
{
    const LoadedPlayList& list = m_rPlayhead.LoadedList();
    const Chapter& chapter = list.timeLine.chapters[m_SelectedButton - 1U];
    m_rState.button.program =
        new ButtonProgram({ButtonCommand(bdmv::INavigationCommandData::CommandPopupMenuOff),
                           ButtonCommand(bdmv::INavigationCommandData::CommandPlayPLatMK,
                                         list.number, static_cast<bd::UInt32>(chapter.mark))});
    m_rState.button.ticket = ++m_LastTicket;
    m_rState.button.id = m_SelectedButton;
    m_rSender.Send<bdmv::ButtonActivationBusyEvent>();
    m_rSender.Send<bdmv::ExecuteButtonEvent>();
    m_rSender.Send<bdmv::ButtonActivationDoneEvent>();
    m_rState.button = PendingButton();
    Close();
    return chapter;
}

} // namespace deskplayer

/**
 * @file
 * The pop-up menu of a play item.
 */
#ifndef DESKPLAYER_NAVIGATOR_POPUPMENU_H
#define DESKPLAYER_NAVIGATOR_POPUPMENU_H

#include <cstddef>

#include "navigator/eventsender.h"
#include "navigator/playbackstate.h"
#include "navigator/playhead.h"

namespace deskplayer
{

/**
 * A menu with a button for each chapter, in the order of the chapters. Buttons are numbered from 1.
 *
 * The interactive graphics stream is not read; the menu is derived from the chapters.
 */
class PopUpMenu
{
public:
    /** @param playhead, @p state and @p sender must outlive the menu */
    PopUpMenu(const Playhead& playhead, PlaybackState& state, EventSender& sender)
        : m_rPlayhead(playhead), m_rState(state), m_rSender(sender)
    {
    }

    PopUpMenu(const PopUpMenu&) = delete;
    PopUpMenu& operator=(const PopUpMenu&) = delete;

    bool IsOpen() const { return m_Open; }

    /** Opens the menu and selects the button of the current chapter; button 1 before the first. */
    void Open();

    /** Closes the menu if it is open. */
    void Close();

    std::size_t NumberOfButtons() const;
    bd::ButtonId SelectedButton() const { return m_SelectedButton; }

    /** @param button must exist */
    void Select(bd::ButtonId button) { m_SelectedButton = button; }

    /**
     * Passes the program of the selected button to the listeners and closes the menu.
     *
     * @return the chapter that the program plays from its start
     */
    const Chapter& ExecuteSelectedButton();

private:
    const Playhead& m_rPlayhead;
    PlaybackState& m_rState;
    EventSender& m_rSender;
    bool m_Open = false;
    bd::ButtonId m_SelectedButton = 1;
    bd::UInt32 m_LastTicket = 0;
};

} // namespace deskplayer

#endif

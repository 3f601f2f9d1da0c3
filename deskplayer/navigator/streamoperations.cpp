// The operations of the navigator on streams, the picture and the menu.

#include <cstdint>
#include <string>
#include <utility>
#include <vector>

#include "bdmvnavigator/navigatorevent.h"
#include "navigator/simulatednavigator.h"

namespace deskplayer
{

namespace
{

/** An empty text if a rectangle has an area and lies within the picture, otherwise why not. */
std::string ProblemOf(const bd::ZoomRectangleDef& rectangle)
{
    if (rectangle.Width == 0 || rectangle.Height == 0) {
        return "a rectangle of " + std::to_string(rectangle.Width) + "x" +
               std::to_string(rectangle.Height) + " has no area";
    }
    const std::uint32_t right = std::uint32_t{rectangle.X} + rectangle.Width;
    const std::uint32_t bottom = std::uint32_t{rectangle.Y} + rectangle.Height;
    if (right > WholePicture.Width || bottom > WholePicture.Height) {
        return "the rectangle extends to " + std::to_string(right) + "," + std::to_string(bottom) +
               ", but the picture is " + std::to_string(WholePicture.Width) + "x" +
               std::to_string(WholePicture.Height);
    }
    return "";
}

} // namespace

// ---------------------------------------------------------------------------------------------
// Streams

template <typename Number>
Outcome SimulatedNavigator::SelectStream(bd::UserOperationMaskDef operation, std::uint64_t number,
                                         std::size_t count, const char* what, Number& selected)
{
    Outcome outcome = m_Permission.CheckActive();
    if (outcome.IsDone() && (number == 0 || number > count)) {
        outcome = Outcome::NoSuch(what, number, count);
    }
    return Operate(operation, outcome, [&] {
        selected = static_cast<Number>(number);
        m_Announcer.AnnounceStreams();
    });
}

template <typename Event>
Outcome SimulatedNavigator::Switch(bd::UserOperationMaskDef operation, const Outcome& possible,
                                   bool& shown, bool value)
{
    return Operate(operation, possible, [&, value] {
        shown = value;
        m_Sender.Send<Event>();
    });
}

/** Streams can be hidden at any time, but shown only if there are any. */
Outcome SimulatedNavigator::CheckShowing(bool shown, const std::vector<Stream>& streams,
                                         const char* what) const
{
    Outcome outcome = m_Permission.CheckActive();
    if (outcome.IsDone() && shown && streams.empty()) {
        outcome = Outcome::Refused(std::string("the play item has no ") + what);
    }
    return outcome;
}

Outcome SimulatedNavigator::SelectAudio(std::uint64_t number)
{
    return SelectStream(bd::UserOperationPrimaryAudioStreamNumberChange, number,
                        m_Playhead.CurrentStreams().primaryAudio.size(), "audio stream",
                        m_State.selection.audio);
}

Outcome SimulatedNavigator::SelectSubtitle(std::uint64_t number)
{
    return SelectStream(bd::UserOperationPGTextSTStreamNumberChange, number,
                        m_Playhead.CurrentStreams().pg.size(), "subtitle stream",
                        m_State.selection.pg);
}

Outcome SimulatedNavigator::ShowSubtitles(bool shown)
{
    return Switch<bdmv::PresentationGraphicsDisplayEvent>(bd::UserOperationPGTextSTEnableDisable,
                                                          m_Permission.CheckActive(),
                                                          m_State.selection.pgShown, shown);
}

Outcome SimulatedNavigator::SelectStyle(std::uint64_t number)
{
    Outcome outcome = m_Permission.CheckActive();
    const bd::UInt8 count = m_Context.GetNumberOfTextSubtitleStyles();
    if (outcome.IsDone() && (number == 0 || number > count)) {
        outcome = Outcome::NoSuch("text subtitle style", number, count);
    }
    return Operate(outcome, [this, number] {
        m_State.selection.style = static_cast<bd::UserStyleNumber>(number);
        m_Sender.Send<bdmv::TextSubtitleStyleInfoEvent>();
    });
}

Outcome SimulatedNavigator::SelectAngle(std::uint64_t number)
{
    return SelectStream(bd::UserOperationAngleNumberChange, number, m_Context.ChosenAngle().second,
                        "angle", m_State.selection.angle);
}

Outcome SimulatedNavigator::SelectSecondaryVideo(std::uint64_t number)
{
    return SelectStream(bd::UserOperationSecondaryVideoStreamNumberChange, number,
                        m_Playhead.CurrentStreams().secondaryVideo.size(), "secondary video stream",
                        m_State.selection.secondaryVideo);
}

Outcome SimulatedNavigator::ShowSecondaryVideo(bool shown)
{
    const Outcome possible =
        CheckShowing(shown, m_Playhead.CurrentStreams().secondaryVideo, "secondary video");
    return Switch<bdmv::SecondaryVideoDisplayEvent>(bd::UserOperationSecondaryVideoEnableDisable,
                                                    possible, m_State.selection.secondaryVideoShown,
                                                    shown);
}

Outcome SimulatedNavigator::SelectSecondaryAudio(std::uint64_t number)
{
    return SelectStream(bd::UserOperationSecondaryAudioStreamNumberChange, number,
                        m_Playhead.CurrentStreams().secondaryAudio.size(), "secondary audio stream",
                        m_State.selection.secondaryAudio);
}

Outcome SimulatedNavigator::ShowSecondaryAudio(bool shown)
{
    const Outcome possible =
        CheckShowing(shown, m_Playhead.CurrentStreams().secondaryAudio, "secondary audio");
    return Switch<bdmv::SecondaryAudioDisplayEvent>(bd::UserOperationSecondaryAudioEnableDisable,
                                                    possible, m_State.selection.secondaryAudioShown,
                                                    shown);
}

Outcome SimulatedNavigator::SelectPipSubtitle(std::uint64_t number)
{
    return SelectStream(bd::UserOperationPiPPGTextSTStreamNumberChange, number,
                        m_Playhead.CurrentStreams().pipPg.size(),
                        "picture-in-picture subtitle stream", m_State.selection.pipPg);
}

Outcome SimulatedNavigator::PickPipSubtitle(bool pick)
{
    return Switch<bdmv::PipPgTextSelectEvent>(bd::UserOperationPiPPGTextSTStreamNumberChange,
                                              m_Permission.CheckActive(),
                                              m_State.selection.pipPgPicked, pick);
}

Outcome SimulatedNavigator::Zoom(const bd::ZOOM_PARAM_Def& zoom)
{
    Outcome outcome = m_Permission.CheckActive();
    for (const bd::ZoomRectangleDef& rectangle : {zoom.rClipRectangle, zoom.rDestRectangle}) {
        const std::string problem = ProblemOf(rectangle);
        if (outcome.IsDone() && !problem.empty()) {
            outcome = Outcome::Refused(problem);
        }
    }
    return Operate(outcome, [this, &zoom] {
        m_State.zoom = zoom;
        m_Sender.Send<bdmv::ZoomModeSetEvent>();
    });
}

// ---------------------------------------------------------------------------------------------
// The menu

Outcome SimulatedNavigator::CheckMenu() const
{
    return m_Menu.IsOpen() ? m_Permission.CheckActive() : Outcome::Refused("no menu is open");
}

Outcome SimulatedNavigator::CheckButton(std::uint64_t number) const
{
    const std::size_t count = m_Menu.NumberOfButtons();
    const Outcome outcome = CheckMenu();
    return !outcome.IsDone() || (number != 0 && number <= count)
               ? outcome
               : Outcome::NoSuch("button", number, count);
}

Outcome SimulatedNavigator::OpenPopUpMenu()
{
    Outcome outcome = m_Permission.CheckActive();
    if (outcome.IsDone() && m_Playhead.CurrentStreams().ig.empty()) {
        outcome = Outcome::Refused("the play item has no menu");
    } else if (outcome.IsDone() && m_Menu.IsOpen()) {
        outcome = Outcome::Refused("the menu is already open");
    }
    return Operate(bd::UserOperationPopupOn, outcome, [this] { m_Menu.Open(); });
}

Outcome SimulatedNavigator::ClosePopUpMenu()
{
    return Operate(bd::UserOperationPopupOff, CheckMenu(), [this] { m_Menu.Close(); });
}

Outcome SimulatedNavigator::SelectPreviousButton()
{
    const std::uint64_t number = m_Menu.SelectedButton() - 1U;
    return Operate(bd::UserOperationMoveUpSelectedButton, CheckButton(number),
                   [this, number] { m_Menu.Select(static_cast<bd::ButtonId>(number)); });
}

Outcome SimulatedNavigator::SelectNextButton()
{
    const std::uint64_t number = m_Menu.SelectedButton() + 1U;
    return Operate(bd::UserOperationMoveDownSelectedButton, CheckButton(number),
                   [this, number] { m_Menu.Select(static_cast<bd::ButtonId>(number)); });
}

Outcome SimulatedNavigator::SelectButton(std::uint64_t number)
{
    return Operate(bd::UserOperationSelectButton, CheckButton(number),
                   [this, number] { m_Menu.Select(static_cast<bd::ButtonId>(number)); });
}

Outcome SimulatedNavigator::ActivateButton()
{
    return Operate(bd::UserOperationActivateButton, CheckButton(m_Menu.SelectedButton()),
                   [this] { ActivateSelectedButton(); });
}

Outcome SimulatedNavigator::SelectAndActivateButton(std::uint64_t number)
{
    return Operate(bd::UserOperationSelectButtonAndActivate, CheckButton(number), [this, number] {
        m_Menu.Select(static_cast<bd::ButtonId>(number));
        ActivateSelectedButton();
    });
}

/** Passes the button's program to the listeners, then carries it out. */
void SimulatedNavigator::ActivateSelectedButton()
{
    m_Transport.JumpTo(m_Menu.ExecuteSelectedButton().start);
}

} // namespace deskplayer

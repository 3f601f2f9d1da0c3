#include "navigator/simulatednavigator.h"

#include <algorithm>
#include <memory>
#include <utility>

#include "bdmvnavigator/navigatorevent.h"
#include "disc/codes.h"

namespace deskplayer
{

namespace
{

/** How long a picture of @p video is shown, in ticks, rounded to the nearest. */
std::uint64_t PictureDuration(const std::vector<Stream>& videos)
{
    constexpr std::uint8_t FrameRate23976 = 1;
    constexpr std::uint8_t FrameRate24 = 2;
    constexpr std::uint8_t FrameRate2997 = 4;
    constexpr std::uint8_t FrameRate50 = 6;
    constexpr std::uint8_t FrameRate5994 = 7;

    switch (videos.empty() ? 0 : videos.front().attributes.frameRate) {
    case FrameRate23976:
        return 1877;
    case FrameRate24:
        return 1875;
    case FrameRate2997:
        return 1502;
    case FrameRate50:
        return 900;
    case FrameRate5994:
        return 751;
    default:
        return 1800; // 25 Hz
    }
}

} // namespace

SimulatedNavigator::SimulatedNavigator(LoadedPlayList playList, VirtualClock& clock,
                                       EventDelivery& delivery)
    : PlaybackContext(std::move(playList)), m_rClock(clock), m_rDelivery(delivery)
{
}

void SimulatedNavigator::Play()
{
    State() = PlaybackState();
    m_Status = Status::Playing;
    Send<bdmv::PlayStartedEvent>();
    if (CurrentItem() == nullptr) {
        m_Status = Status::Finished;
        Send<bdmv::FinishedEvent>();
        return;
    }
    Send<bdmv::FirstPictureDeliveredEvent>();
}

void SimulatedNavigator::Pause()
{
    if (m_Status == Status::Playing) {
        m_Status = Status::Paused;
        Send<bdmv::PausedEvent>();
    }
}

void SimulatedNavigator::Continue()
{
    if (m_Status == Status::Paused) {
        m_Status = Status::Playing;
        Send<bdmv::ContinuedEvent>();
    }
}

void SimulatedNavigator::Step()
{
    const std::uint64_t next = State().position + PictureDuration(CurrentStreams().primaryVideo);
    if (m_Status == Status::Paused && next < EndOfItem()) {
        State().position = next;
        Send<bdmv::SteppedEvent>();
    }
}

void SimulatedNavigator::EndStill()
{
    if (m_Status == Status::Still) {
        m_Status = Status::Playing;
        Send<bdmv::StillOffEvent>();
        EnterNextItem();
    }
}

void SimulatedNavigator::Stop()
{
    if (m_Status != Status::Stopped && m_Status != Status::Finished) {
        m_Status = Status::Stopped;
        Send<bdmv::StoppedEvent>();
    }
}

std::optional<std::uint64_t> SimulatedNavigator::TimeToNextChange() const
{
    switch (m_Status) {
    case Status::Playing:
        return EndOfItem() - State().position;
    case Status::Still:
        return m_StillLeft;
    default:
        return std::nullopt;
    }
}

std::uint64_t SimulatedNavigator::Advance(std::uint64_t ticks)
{
    while (m_Status != Status::Stopped && m_Status != Status::Finished) {
        const std::optional<std::uint64_t> next = TimeToNextChange();
        const std::uint64_t pass = std::min(ticks, next.value_or(ticks));
        m_rClock.Advance(pass);
        ticks -= pass;
        if (m_Status == Status::Playing) {
            State().position += pass;
        } else if (m_Status == Status::Still && m_StillLeft) {
            *m_StillLeft -= pass;
        }

        if (next != pass) {
            break;
        }
        if (m_Status == Status::Playing) {
            ReachEndOfItem();
        } else {
            EndStill();
        }
    }
    return ticks;
}

template <typename Event> void SimulatedNavigator::Send()
{
    m_rDelivery.Post(std::make_unique<Event>(*this));
    m_rDelivery.Settle();
}

std::uint64_t SimulatedNavigator::EndOfItem() const
{
    const TimeLine& timeLine = PlayListInPlayback().timeLine;
    const std::size_t next = State().item + 1;
    return next < timeLine.itemStarts.size() ? timeLine.itemStarts[next] : timeLine.duration;
}

void SimulatedNavigator::ReachEndOfItem()
{
    const PlayItem& item = *CurrentItem();
    if (item.stillMode == StillModeNone) {
        EnterNextItem();
        return;
    }
    m_Status = Status::Still;
    m_StillLeft = std::nullopt;
    if (item.stillMode == StillModeTimed) {
        m_StillLeft = std::uint64_t{item.stillTime} * TicksPerSecond;
    }
    Send<bdmv::StillOnEvent>();
}

void SimulatedNavigator::EnterNextItem()
{
    if (State().item + 1 < PlayListInPlayback().playList.playItems.size()) {
        State().previousItem = State().item;
        ++State().item;
        return;
    }
    m_Status = Status::Finished;
    State().finishedReason = bdstreaming::FinishedReasonEndOfMedia;
    Send<bdmv::FinishedEvent>();
}

} // namespace deskplayer

#include "navigator/announcer.h"

#include <algorithm>
#include <utility>

#include "bdmvnavigator/navigatorevent.h"
#include "navigator/audioinfo.h"

namespace deskplayer
{

void Announcer::AnnounceItem()
{
    m_rSender.Send<bdmv::PlayItemEvent>();
    AnnounceStreams();
    AnnounceSyncStreams();
    AnnounceMask();
}

void Announcer::AnnounceStreams()
{
    struct Kind {
        PlaybackContext::NumberAndCount now;
        void (EventSender::*send)();
    };
    const std::array<Kind, StreamKinds> kinds = {
        {{m_rContext.ChosenVideo(), &EventSender::Send<bdmv::VideoInfoEvent>},
         {m_rContext.ChosenAudio(), &EventSender::Send<bdmv::AudioInfoEvent>},
         {m_rContext.ChosenAngle(), &EventSender::Send<bdmv::AngleInfoEvent>},
         {m_rContext.ChosenPg(), &EventSender::Send<bdmv::PresentationGraphicsInfoEvent>},
         {m_rContext.ChosenSecondaryVideo(), &EventSender::Send<bdmv::SecondaryVideoInfoEvent>},
         {m_rContext.ChosenSecondaryAudio(), &EventSender::Send<bdmv::SecondaryAudioInfoEvent>},
         {m_rContext.ChosenPipPg(), &EventSender::Send<bdmv::PipPgTextStInfoEvent>},
         {m_rContext.ChosenIg(), &EventSender::Send<bdmv::InteractiveGraphicsInfoEvent>}}};

    for (std::size_t i = 0; i < kinds.size(); ++i) {
        if (std::exchange(m_Announced.streams[i], kinds[i].now) != kinds[i].now) {
            (m_rSender.*kinds[i].send)();
        }
    }

    const StreamTable& streams = m_rPlayhead.CurrentStreams();
    AnnounceAudioInfo(true, streams.primaryAudio, m_rState.selection.audio, m_Announced.audio);
    AnnounceAudioInfo(false, streams.secondaryAudio, m_rState.selection.secondaryAudio,
                      m_Announced.secondaryAudio);

    const bd::UInt8 styles = m_rContext.GetNumberOfTextSubtitleStyles();
    if (std::exchange(m_Announced.styles, styles) != styles) {
        m_rSender.Send<bdmv::TextSubtitleStylesAvailableEvent>();
        if (styles != 0) {
            m_rSender.Send<bdmv::TextSubtitleStyleInfoEvent>();
        }
    }
}

void Announcer::AnnounceAudioInfo(bool isPrimary, const std::vector<Stream>& streams,
                                  bd::StreamNumberDef number,
                                  std::optional<bd::AudioInfoType>& announced)
{
    if (streams.empty()) {
        announced.reset();
        return;
    }
    const bd::AudioInfoType now =
        AudioInfoOf(streams[std::min<std::size_t>(number, streams.size()) - 1]);
    if (announced != now) {
        announced = now;
        m_rSender.Send<bdmv::AudioInfoChangedEvent>(isPrimary, now);
    }
}

void Announcer::AnnounceSyncStreams()
{
    const bool atNormalSpeed = m_rState.currentPlayMode.Speed() == bd::PlaySpeedNormal;
    const auto anySync = [this](const std::vector<Stream>& streams) {
        return std::any_of(streams.begin(), streams.end(),
                           [this](const Stream& stream) { return !m_rContext.IsAsync(stream); });
    };
    const StreamTable& streams = m_rPlayhead.CurrentStreams();
    const bool pip = anySync(streams.secondaryVideo) && atNormalSpeed;
    const bool audio = anySync(streams.secondaryAudio) && atNormalSpeed;
    if (std::exchange(m_Announced.syncPipAvailable, pip) != pip) {
        if (pip) {
            m_rSender.Send<bdmv::PipAvailableEvent>();
        } else if (!streams.secondaryVideo.empty()) {
            m_rSender.Send<bdmv::PipUnavailableEvent>();
        }
    }
    if (std::exchange(m_Announced.syncSecondaryAudioAvailable, audio) != audio) {
        if (audio) {
            m_rSender.Send<bdmv::SecondaryAudioAvailableEvent>();
        } else if (!streams.secondaryAudio.empty()) {
            m_rSender.Send<bdmv::SecondaryAudioUnavailableEvent>();
        }
    }
}

void Announcer::AnnounceMask()
{
    bdmv::UOMaskTable mask;
    m_rContext.GetUOMask(mask);
    if (!m_Announced.mask || !(*m_Announced.mask == mask)) {
        m_Announced.mask = mask;
        m_rSender.Send<bdmv::UOMaskEvent>();
    }
}

void Announcer::AnnounceMenu()
{
    const bool available = !m_rPlayhead.CurrentStreams().ig.empty();
    if (std::exchange(m_Announced.popUpMenuAvailable, available) == available) {
        return;
    }
    if (available) {
        m_rSender.Send<bdmv::PopUpMenuAvailableEvent>();
    } else {
        m_rSender.Send<bdmv::PopUpMenuUnavailableEvent>();
    }
}

void Announcer::AnnounceChapter()
{
    const bd::ChapterNumberDef chapter = m_rContext.GetCurrentChapter();
    if (std::exchange(m_Announced.chapter, chapter) != chapter) {
        m_rSender.Send<bdmv::ChapterEvent>();
    }
}

} // namespace deskplayer

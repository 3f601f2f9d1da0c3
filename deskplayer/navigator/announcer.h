/**
 * @file
 * The latest announcements to the listeners.
 */
#ifndef DESKPLAYER_NAVIGATOR_ANNOUNCER_H
#define DESKPLAYER_NAVIGATOR_ANNOUNCER_H

#include <array>
#include <cstddef>
#include <optional>
#include <vector>

#include "database/uomasktable.h"
#include "navigator/eventsender.h"
#include "navigator/playbackcontext.h"
#include "navigator/playbackstate.h"
#include "navigator/playhead.h"

namespace deskplayer
{

/** Sends events for everything that differs from the last announcement. Never changes playback. */
class Announcer
{
public:
    /** @param playhead, @p state, @p context and @p sender must outlive the announcer */
    Announcer(const Playhead& playhead, const PlaybackState& state, PlaybackContext& context,
              EventSender& sender)
        : m_rPlayhead(playhead), m_rState(state), m_rContext(context), m_rSender(sender)
    {
    }

    Announcer(const Announcer&) = delete;
    Announcer& operator=(const Announcer&) = delete;

    /** Forgets all announcements, so that everything counts as different. */
    void Forget() { m_Announced = Announced(); }

    /** Announces the play item, and its streams and mask if they differ. */
    void AnnounceItem();

    /** Announces stream numbers and counts, audio attributes and text subtitle styles. */
    void AnnounceStreams();

    /**
     * Announces whether the secondary streams on the time base of the play item are available.
     * PlayItemEvent and PlayModeEvent do so for asynchronous ones.
     */
    void AnnounceSyncStreams();

    /** Announces whether a pop-up menu is available. */
    void AnnounceMenu();

    void AnnounceChapter();

    /** The last announced chapter; 0 for none. */
    bd::ChapterNumberDef AnnouncedChapter() const { return m_Announced.chapter; }

private:
    /** Kinds of streams whose number and count are announced. */
    static constexpr std::size_t StreamKinds = 8;

    struct Announced {
        std::array<PlaybackContext::NumberAndCount, StreamKinds> streams;
        std::optional<bd::AudioInfoType> audio;
        std::optional<bd::AudioInfoType> secondaryAudio;
        bool syncPipAvailable = false;
        bool syncSecondaryAudioAvailable = false;
        bd::UInt8 styles = 0;
        bool popUpMenuAvailable = false;
        std::optional<bdmv::UOMaskTable> mask;
        bd::ChapterNumberDef chapter = 0;
    };

    void AnnounceAudioInfo(bool isPrimary, const std::vector<Stream>& streams,
                           bd::StreamNumberDef number, std::optional<bd::AudioInfoType>& announced);
    void AnnounceMask();

    const Playhead& m_rPlayhead;
    const PlaybackState& m_rState;
    PlaybackContext& m_rContext;
    EventSender& m_rSender;
    Announced m_Announced;
};

} // namespace deskplayer

#endif

/**
 * @file
 * What the listeners were notified of last.
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

/** Sends the events of what differs from the last announcement. Changes nothing in playback. */
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

    /** Forgets what was announced, so that everything counts as different. */
    void Forget() { m_Announced = Announced(); }

    /** The play item, which is always announced, its streams and its mask. */
    void AnnounceItem();

    /** The kinds of streams whose number or count has changed, audio details, styles. */
    void AnnounceStreams();

    /**
     * Whether the secondary streams on the time base of the play item are available.
     * PlayItemEvent and PlayModeEvent announce the asynchronous ones.
     */
    void AnnounceSyncStreams();

    /** Whether there is a pop-up menu. */
    void AnnounceMenu();

    void AnnounceChapter();

    /** The chapter that was announced last; 0 for none. */
    bd::ChapterNumberDef AnnouncedChapter() const { return m_Announced.chapter; }

private:
    /** The kinds of streams whose number and count events report. */
    static constexpr std::size_t StreamKinds = 8;

    struct Announced {
        std::array<PlaybackContext::NumberAndCount, StreamKinds> streams;
        std::optional<bd::AudioInfoType> audio;
        std::optional<bd::AudioInfoType> secondaryAudio;
        bool syncPip = false;            ///< as available
        bool syncSecondaryAudio = false; ///< as available
        bd::UInt8 styles = 0;
        bool popUpMenu = false; ///< as available
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

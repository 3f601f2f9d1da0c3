/**
 * @file
 * Plays a disc for a client's listeners: the first object of a client's test.
 *
 * @code
 * deskplayer::Desk desk("/media/disc"); // its longest play list
 * desk.Listeners().AddListener(&frontPanel);
 * deskplayer::PlayFromStartToEnd(desk);
 * desk.Listeners().RemoveListener(&frontPanel);
 * @endcode
 *
 * Link bdmvnavigator::deskplayer and a platform interface: bdmvnavigator::linux, or your own.
 *
 * Threads: callbacks run on a thread of the desk, as they do in a player. The operation that causes
 * a callback returns after it, so a test may look at its listener between two operations without
 * a lock.
 *
 * Exceptions: what a listener throws leaves the operation that caused the callback.
 *
 * Lifetime: a listener outlives its registration. One that is destroyed before the desk must be
 * removed first, unless no operation follows.
 */
#ifndef DESKPLAYER_INC_DESKPLAYER_DESK_H
#define DESKPLAYER_INC_DESKPLAYER_DESK_H

#include <cstdint>
#include <filesystem>
#include <memory>
#include <optional>
#include <vector>

#include "bdmvnavigator/inavigatorevent.h"
#include "deskplayer/errors.h"
#include "deskplayer/ticks.h"

namespace deskplayer
{

class DeskParts;

/**
 * A navigator on a virtual clock, with a play list of a disc. Playback starts with PlaySession() or
 * PlayFromStartToEnd().
 *
 * Call all operations from one thread, except where noted.
 */
class Desk
{
public:
    /**
     * Reads a play list and the clips it refers to; nothing is read later.
     *
     * @param disc      a BDMV folder or its parent
     * @param playList  the number of the play list, 800 for 00800.mpls; the longest one without
     * @param onMessage receives, before the constructor returns, what does not prevent playback: a
     *                  backup copy was used, a play list was skipped, a clip cannot be read
     * @throw DiscError the disc or the play list cannot be read, or none can be played
     */
    explicit Desk(const std::filesystem::path& disc,
                  std::optional<std::uint32_t> playList = std::nullopt,
                  const MessageHandler& onMessage = {});
    ~Desk();
    Desk(const Desk&) = delete;
    Desk& operator=(const Desk&) = delete;

    /** The list in which listeners register. Any thread. */
    bdmv::INavigatorEvent::Listeners& Listeners();

    /** The number of the play list. */
    std::uint32_t PlayListNumber() const;

    /** The time since the first session began. Any thread, also inside a callback. */
    Ticks Now() const;

    /**
     * The block that listeners received with the last SystemSuspended(); empty before the first.
     * The desk wakes up with it.
     */
    const std::vector<bd::UInt8>& ResumeData() const;

private:
    friend DeskParts& PartsOf(Desk& desk);

    const std::unique_ptr<DeskParts> m_pParts;
};

} // namespace deskplayer

#endif

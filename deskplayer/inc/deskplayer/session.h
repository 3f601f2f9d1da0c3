/**
 * @file
 * Sessions: what a viewer does, and when, as a text.
 *
 * @code
 * const deskplayer::Session session("play\n"
 *                                   "at 00:20 pause\n"
 *                                   "expect Paused\n");
 * const deskplayer::SessionReport report = deskplayer::PlaySession(desk, session);
 * EXPECT_EQ(report.unmet, std::vector<std::string>());
 * EXPECT_EQ(report.refused, std::vector<std::string>());
 * @endcode
 *
 * `bdmv-deskplayer --commands` lists the commands, its manual page describes times and
 * expectations. An expectation concerns the callbacks since the last command of its session.
 *
 * After its last step a session plays on, so a client is at the end of playback when PlaySession()
 * returns. To look at a client in between, end the session in a pause, or set
 * SessionOptions::playOn to false and continue with another session on the same desk.
 */
#ifndef DESKPLAYER_INC_DESKPLAYER_SESSION_H
#define DESKPLAYER_INC_DESKPLAYER_SESSION_H

#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "deskplayer/desk.h"
#include "deskplayer/errors.h"
#include "deskplayer/ticks.h"

namespace deskplayer
{

struct SessionOptions;
struct SessionReport;

/** A session: an immutable value, cheap to copy, to play on any number of desks. */
class Session
{
public:
    /**
     * Reads a session from its text.
     *
     * @param name of the session in messages
     * @throw SessionError the text is malformed; names the first malformed line, and what was
     *        expected there: "session:3:9: unexpected 'nxt'; expected next, previous or a NUMBER"
     */
    explicit Session(std::string_view text, const std::string& name = "session");

    // Declared, so that moving copies: a session that was moved from can be played as before.
    ~Session() = default;
    Session(const Session&) = default;
    Session& operator=(const Session&) = default;

private:
    struct Script;
    friend SessionReport PlaySession(Desk& desk, const Session& session,
                                     const SessionOptions& options);

    std::shared_ptr<const Script> m_pScript;
};

/**
 * Reads a session from a file or a pipe, whose name appears in messages.
 *
 * @throw SessionError the file cannot be read, is too long, is a pipe without input, or is
 *        malformed
 */
Session ReadSessionFile(const std::string& fileName);

/** Called before the clock advances by @p time, up to the next moment when something changes. */
using TimeHandler = std::function<void(Ticks time)>;

/** How to play a session. */
struct SessionOptions {
    /**
     * Whether playback continues after the last step, until it ends, waits for the viewer, or would
     * repeat forever.
     */
    bool playOn = true;

    /** May be empty. A session in real time waits here. */
    TimeHandler beforeTimePasses;

    /** Receives each line of the report at once. May be empty. */
    MessageHandler onMessage;
};

/** What went otherwise than a session demands, in the order of time. Neither ends the session. */
struct SessionReport {
    /**
     * One line for each expectation that was not met:
     *
     *     session:3: expected Paused by 00:00:20.000; since the last command: nothing
     */
    std::vector<std::string> unmet;

    /**
     * One line for each command that was refused, because the disc forbids it or because it is not
     * possible at that moment:
     *
     *     session:3: refused at 00:00:20.000: not paused, but playing
     */
    std::vector<std::string> refused;
};

/**
 * Plays a session. Its times count from the moment of the call.
 *
 * @throw any exception thrown by a listener; playback cannot continue on this desk
 */
[[nodiscard]] SessionReport PlaySession(Desk& desk, const Session& session,
                                        const SessionOptions& options = {});

/**
 * Plays from the start to the end of the play list without a viewer: an endless still ends after
 * three seconds.
 *
 * @throw any exception thrown by a listener; playback cannot continue on this desk
 */
void PlayFromStartToEnd(Desk& desk, const TimeHandler& beforeTimePasses = {});

} // namespace deskplayer

#endif

/**
 * @file
 * Progress of a long session.
 */
#ifndef DESKPLAYER_PROGRAM_PROGRESS_H
#define DESKPLAYER_PROGRAM_PROGRESS_H

#include <unistd.h>

#include <chrono>
#include <cstddef>
#include <iostream>
#include <string>

#include "navigator/virtualclock.h"
#include "program/options.h"
#include "text/timetext.h"

namespace deskplayer
{

/** Shows the time of the session on a terminal once playback takes more than a second. */
class Progress
{
public:
    /** @param options if they send output to the same terminal, progress is not shown */
    Progress(const VirtualClock& clock, const Options& options)
        : m_rClock(clock), m_Possible(isatty(STDERR_FILENO) != 0 &&
                                      (isatty(STDOUT_FILENO) == 0 || !options.output.empty()))
    {
    }

    ~Progress()
    {
        if (m_Shown) {
            std::cerr << '\r' << std::string(Width, ' ') << '\r';
        }
    }

    Progress(const Progress&) = delete;
    Progress& operator=(const Progress&) = delete;

    void Update()
    {
        const auto now = std::chrono::steady_clock::now();
        if (m_Possible && now >= m_Next) {
            m_Next = now + std::chrono::milliseconds(200);
            m_Shown = true;
            std::cerr << "\r" << TimeText(m_rClock.Now()) << std::flush;
        }
    }

private:
    static constexpr std::size_t Width = sizeof "00:00:00.000";

    const VirtualClock& m_rClock;
    const bool m_Possible;
    bool m_Shown = false;
    std::chrono::steady_clock::time_point m_Next =
        std::chrono::steady_clock::now() + std::chrono::seconds(1);
};

} // namespace deskplayer

#endif

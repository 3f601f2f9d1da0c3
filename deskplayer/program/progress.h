/**
 * @file
 * Progress of a long operation.
 */
#ifndef DESKPLAYER_PROGRAM_PROGRESS_H
#define DESKPLAYER_PROGRAM_PROGRESS_H

#include <unistd.h>

#include <chrono>
#include <cstddef>
#include <iostream>
#include <string>

#include "program/options.h"

namespace deskplayer
{

/** Shows a line on a terminal once the operation takes more than a second. */
class Progress
{
public:
    /**
     * @param options if they send the output of playback to the same terminal, progress is not
     *        shown; a check clears it before it writes, and a summary is written at the end
     */
    explicit Progress(const Options& options)
        : m_Possible(isatty(STDERR_FILENO) != 0 &&
                     (options.check || options.summary || isatty(STDOUT_FILENO) == 0 ||
                      !options.output.empty() || !options.outputFolder.empty()))
    {
    }

    ~Progress() { Clear(); }

    Progress(const Progress&) = delete;
    Progress& operator=(const Progress&) = delete;

    /** @param text returns the line; called only if it is shown, at most five times a second */
    template <typename Text> void Update(const Text& text)
    {
        const auto now = std::chrono::steady_clock::now();
        if (m_Possible && now >= m_Next) {
            m_Next = now + std::chrono::milliseconds(200);
            Clear();
            const std::string line = text();
            std::cerr << '\r' << line << std::flush;
            m_Width = line.size() + 1; // and the cursor
        }
    }

    /** Removes the line, so that another one can be written. */
    void Clear()
    {
        if (m_Width > 0) {
            std::cerr << '\r' << std::string(m_Width, ' ') << '\r' << std::flush;
            m_Width = 0;
        }
    }

private:
    const bool m_Possible;
    std::size_t m_Width = 0; ///< to erase; 0 if nothing is shown
    std::chrono::steady_clock::time_point m_Next =
        std::chrono::steady_clock::now() + std::chrono::seconds(1);
};

} // namespace deskplayer

#endif

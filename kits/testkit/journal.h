/**
 * @file
 * A record of calls, in order.
 *
 * The fake platform, the scriptable context and the recording listeners of a test share one
 * journal, so that the test states the whole sequence instead of fragments:
 *
 * @code
 * bdmvtest::Journal journal;
 * bdmvtest::FakePlatform platform(&journal);
 * bdmvtest::ScriptablePlaybackContext context(journal);
 * bdmvtest::RecordingListener a(journal, "A");
 * context.currentTimePosition = 900000;
 * ...
 * journal.Take() ==
 *     "context.GetCurrentTimePosition() -> 900000\n"
 *     "context.GetPlayMode() -> (PlayDirectionBackward, PlaySpeedFast2)\n"
 *     "log? 57 5 0 -> on\n"
 *     "log 57 5 0: Sending Stepped - position: 900000,dir=1\n"
 *     "A.Stepped(900000, PlayDirectionBackward)\n"
 * @endcode
 */
#ifndef TESTKIT_JOURNAL_H
#define TESTKIT_JOURNAL_H

#include <mutex>
#include <string>
#include <utility>

namespace bdmvtest
{

/** A text with one line per entry. Several threads may write to it at once. */
class Journal
{
public:
    /** Adds an entry, which has no line end. */
    void Add(const std::string& entry)
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        m_Text += entry;
        m_Text += '\n';
    }

    /** Returns the entries since the last call, each followed by a line end. */
    std::string Take()
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        return std::exchange(m_Text, std::string());
    }

private:
    std::mutex m_Mutex;
    std::string m_Text;
};

} // namespace bdmvtest

#endif

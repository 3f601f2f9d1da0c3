/**
 * @file
 * Remembers callbacks, to compare them with expectations.
 */
#ifndef DESKPLAYER_OUTPUT_CALLBACKRECORDER_H
#define DESKPLAYER_OUTPUT_CALLBACKRECORDER_H

#include <string>
#include <string_view>
#include <vector>

#include "clientkit/callback.h"

namespace deskplayer
{

/**
 * Remembers all callbacks since Clear().
 *
 * Records on the delivering thread. The navigator's thread may call the other operations whenever
 * no event is queued or being dispatched.
 */
class CallbackRecorder : public bdmv::CallbackListener
{
public:
    /** Forgets all callbacks. */
    void Clear() { m_Callbacks.clear(); }

    bool IsEmpty() const { return m_Callbacks.empty(); }

    /**
     * Whether a callback with this name has all these arguments; it may have more.
     *
     * @param arguments as the text output writes them: "number=2"
     */
    bool Contains(std::string_view name, const std::vector<std::string>& arguments) const;

    /**
     * All callbacks on one line: "Paused, AudioInfo number=2"; "nothing" without any. Of more than
     * forty, the first and the last twenty.
     */
    std::string Text() const;

private:
    struct Recorded {
        std::string_view name;
        std::vector<std::string> arguments;
    };

    void OnCallback(const bdmv::Callback& callback) override;

    std::vector<Recorded> m_Callbacks;
};

} // namespace deskplayer

#endif

#include "logchannel.h"

#include <utility>

namespace kevro
{

class LogChannel::Use
{
public:
    explicit Use(LogChannel& channel) : m_rChannel(channel)
    {
        const std::lock_guard<std::mutex> lock(m_rChannel.m_PlaceMutex);
        m_pPlace = m_rChannel.m_Current.get();
        ++m_pPlace->users;
    }

    ~Use()
    {
        const std::lock_guard<std::mutex> lock(m_rChannel.m_PlaceMutex);
        if (--m_pPlace->users == 0) {
            m_rChannel.m_PlaceLeft.notify_all();
        }
    }

    Use(const Use&) = delete;
    Use& operator=(const Use&) = delete;

    Output* operator->() const { return m_pPlace->output.get(); }

private:
    LogChannel& m_rChannel;
    Place* m_pPlace;
};

LogChannel::LogChannel(std::unique_ptr<Output> output) : m_Current(new Place{std::move(output), 0})
{
}

void LogChannel::Write(spdlog::level::level_enum level, std::string_view line) noexcept
{
    Use(*this)->Write(level, line);
    if (m_Finishing) {
        Flush();
    }
}

void LogChannel::AddLost() noexcept
{
    Use(*this)->AddLost();
}

void LogChannel::Exchange(std::unique_ptr<Output> next)
{
    std::unique_ptr<Place> place(new Place{std::move(next), 0});
    const std::lock_guard<std::mutex> exchange(m_ExchangeMutex);
    {
        std::unique_lock<std::mutex> lock(m_PlaceMutex);
        m_Leaving = std::exchange(m_Current, std::move(place));
        m_PlaceLeft.wait(lock, [this] { return m_Leaving->users == 0; });
    }
    m_Leaving->output->Drain();

    std::unique_ptr<Place> gone; // ends its queue's thread after the lock is released
    const std::lock_guard<std::mutex> lock(m_PlaceMutex);
    m_LostBefore += m_Leaving->output->CountLost();
    gone = std::move(m_Leaving);
}

void LogChannel::Flush() noexcept
{
    // An exchange ends with a flush of the output before, so waiting for it covers that one, too.
    const std::lock_guard<std::mutex> exchange(m_ExchangeMutex);
    m_Current->output->Drain();
}

void LogChannel::Finish() noexcept
{
    m_Finishing = true;
    Flush();
}

KEVRO_UInt64 LogChannel::CountLost() noexcept
{
    const std::lock_guard<std::mutex> lock(m_PlaceMutex);
    return m_LostBefore + m_Current->output->CountLost() +
           (m_Leaving ? m_Leaving->output->CountLost() : 0);
}

} // namespace kevro

/**
 * @file
 * What every benchmark calls, and with what.
 */
#ifndef BENCH_LISTENER_H
#define BENCH_LISTENER_H

#include <cstdint>

#include "bdmvnavigator/navigatorlisteneradapter.h"

namespace bench
{

/**
 * Counts its callbacks, the least that a listener can do. The bodies stand in a source of their
 * own, so that no caller sees through them.
 */
class CountingListener final : public bdmv::NavigatorListenerAdapter
{
public:
    void PlayStarted() override;
    void CurrentTimePosition(const bd::TimePosition& position) override;
    void AudioInfoChanged(bool isPrimary, bd::AudioInfoType info) override;
    void PlayItem(bd::PlayListIdDef playListId, bd::PlayItemIdDef playItemId,
                  bd::VideoFormatType videoFormat, bd::VideoAspectRatioType aspectRatio) override;

private:
    std::uint64_t m_Count = 0;
};

/** The listeners of all rows of one thread: 1024 side by side, so that all rows find them alike. */
CountingListener* Listeners();

// Values that no compiler knows.
extern const bd::TimePosition& Position;
extern const bd::AudioInfoType& AudioInfo;

} // namespace bench

#endif

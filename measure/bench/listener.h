/**
 * @file
 * The listeners that every benchmark calls, and the arguments.
 */
#ifndef BENCH_LISTENER_H
#define BENCH_LISTENER_H

#include <cstdint>

#include "bdmvnavigator/navigatorlisteneradapter.h"

namespace bench
{

/**
 * Counts its callbacks, the least that a listener can do. They are defined in a separate source, so
 * that no caller can inline them.
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

/** The listeners of all single-threaded rows: 1024 in one array, the same for every row. */
CountingListener* Listeners();

// Values that the compiler cannot know.
extern const bd::TimePosition& Position;
extern const bd::AudioInfoType& AudioInfo;

} // namespace bench

#endif

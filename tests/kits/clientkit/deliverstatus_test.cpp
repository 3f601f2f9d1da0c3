#include <gtest/gtest.h>

#include <algorithm>
#include <set>

#include "clientkit/playbackstatus.h"
#include "randomcallbacks.h"

namespace
{

namespace callbacks = bdmv::callbacks;
using bdmv::PlaybackStatus;

/** Continues a status. */
class Follower : public bdmv::CallbackListener
{
public:
    explicit Follower(const PlaybackStatus& initial) : status(initial) {}

    PlaybackStatus status;

protected:
    void OnCallback(const bdmv::Callback& callback) override { Apply(callback, status); }
};

/** What a listener with the status @p earlier has after it was given @p status. */
PlaybackStatus Delivered(const PlaybackStatus& status, const PlaybackStatus& earlier)
{
    Follower follower(earlier);
    Deliver(status, follower);
    return follower.status;
}

/** The statuses before the first callback and after each. */
std::vector<PlaybackStatus> History(const std::vector<bdmv::Callback>& sequence)
{
    std::vector<PlaybackStatus> history(1);
    for (const bdmv::Callback& callback : sequence) {
        history.push_back(history.back());
        Apply(callback, history.back());
    }
    return history;
}

std::vector<bdmv::Callback> CallbacksOf(const PlaybackStatus& status)
{
    bdmvtest::CallbackKeeper keeper;
    Deliver(status, keeper);
    return keeper.callbacks;
}

std::vector<bdmv::Callback> CallbacksAfter(const std::vector<bdmv::Callback>& sequence)
{
    return CallbacksOf(History(sequence).back());
}

TEST(DeliverStatus, GivesARandomStatusToNewAndToEarlierListeners)
{
    for (unsigned seed = 0; seed < 100; ++seed) {
        const std::vector<PlaybackStatus> history =
            History(bdmvtest::RandomCallbacks(seed).Sequence(100));
        for (std::size_t now = 0; now < history.size(); ++now) {
            for (const std::size_t earlier : {std::size_t(0), now / 2, now - now % 7, now}) {
                ASSERT_EQ(Delivered(history[now], history[earlier]), history[now])
                    << "seed " << seed << ", status " << now << " to " << earlier;
            }
        }
    }
}

/** Every sequence of four callbacks that concern the state of playback. */
TEST(DeliverStatus, GivesEveryStateToNewAndToEarlierListeners)
{
    const std::vector<bdmv::Callback> all{
        callbacks::PlayStarted{},       callbacks::Paused{},
        callbacks::StillOn{},           callbacks::StillOff{},
        callbacks::Stopped{},           callbacks::Suspended{},
        callbacks::Resumed{},           callbacks::SystemSuspended{nullptr, 0},
        callbacks::SystemResumed{true},
    };
    const std::size_t count = all.size();
    for (std::size_t number = 0; number < count * count * count * count; ++number) {
        const std::vector<PlaybackStatus> history =
            History({all[number % count], all[number / count % count],
                     all[number / count / count % count], all[number / count / count / count]});
        for (const PlaybackStatus& earlier : history) {
            ASSERT_EQ(Delivered(history.back(), earlier), history.back()) << number;
        }
    }
}

/** Each known part but the state of playback is a number of callbacks that does not change. */
TEST(DeliverStatus, NeverMakesAKnownPartUnknown)
{
    for (unsigned seed = 0; seed < 20; ++seed) {
        std::ptrdiff_t known = 0;
        for (const PlaybackStatus& status :
             History(bdmvtest::RandomCallbacks(seed).Sequence(200))) {
            const std::vector<bdmv::Callback> sent = CallbacksOf(status);
            const std::ptrdiff_t parts =
                std::count_if(sent.begin(), sent.end(), [](const bdmv::Callback& callback) {
                    return callback.Id() == bdmv::CallbackZoomModeSet ||
                           InterfaceOf(callback.Id()) != bdmv::ListenerInterfaceControl;
                });
            ASSERT_GE(parts, known);
            known = parts;
        }
    }
}

TEST(DeliverStatus, SendsNothingMomentary)
{
    const std::set<bdmv::CallbackId> momentary{bdmv::CallbackFirstPictureDelivered,
                                               bdmv::CallbackPlayFailed,
                                               bdmv::CallbackContinued,
                                               bdmv::CallbackStepped,
                                               bdmv::CallbackTriggerTimeReached,
                                               bdmv::CallbackTriggerSet,
                                               bdmv::CallbackFinished,
                                               bdmv::CallbackStillOff,
                                               bdmv::CallbackResumed,
                                               bdmv::CallbackResumeFailed,
                                               bdmv::CallbackSystemResumed,
                                               bdmv::CallbackSystemResumeFailed,
                                               bdmv::CallbackJumpOccurred,
                                               bdmv::CallbackPreloadFailed,
                                               bdmv::CallbackMarkInfo,
                                               bdmv::CallbackExecuteButton};
    for (unsigned seed = 0; seed < 20; ++seed) {
        for (const PlaybackStatus& status :
             History(bdmvtest::RandomCallbacks(seed).Sequence(200))) {
            for (const bdmv::Callback& callback : CallbacksOf(status)) {
                ASSERT_EQ(momentary.count(callback.Id()), 0U) << NameOf(callback.Id());
            }
        }
    }
}

TEST(DeliverStatus, SendsNothingOfAnUnknownStatus)
{
    EXPECT_TRUE(CallbacksOf(PlaybackStatus()).empty());
}

TEST(DeliverStatus, SendsAnEndAsStopped)
{
    EXPECT_EQ(CallbacksAfter({callbacks::Finished{bdmv::INavControlListener::DataStarvation}}),
              std::vector<bdmv::Callback>{callbacks::Stopped{}});
}

TEST(DeliverStatus, SendsStandbyWithoutItsBlock)
{
    const char block[] = "block";

    EXPECT_EQ(CallbacksAfter({callbacks::SystemSuspended{block, sizeof block}}),
              (std::vector<bdmv::Callback>{callbacks::SystemSuspended{nullptr, 0}}));
}

TEST(DeliverStatus, SendsTheStateBeforeASuspension)
{
    EXPECT_EQ(CallbacksAfter({callbacks::Paused{}, callbacks::Suspended{}}),
              (std::vector<bdmv::Callback>{callbacks::Paused{}, callbacks::Suspended{}}));
}

TEST(DeliverStatus, SendsTheStateFirstIfPlaybackIsUnderWay)
{
    EXPECT_EQ(CallbacksAfter({callbacks::ChapterNumber{2}, callbacks::PlayStarted{}}),
              (std::vector<bdmv::Callback>{callbacks::PlayStarted{}, callbacks::ChapterNumber{2}}));
}

TEST(DeliverStatus, SendsTheStateLastIfPlaybackIsOver)
{
    EXPECT_EQ(CallbacksAfter({callbacks::Stopped{}, callbacks::ChapterNumber{2}}),
              (std::vector<bdmv::Callback>{callbacks::ChapterNumber{2}, callbacks::Stopped{}}));
    EXPECT_EQ(CallbacksAfter({callbacks::SystemSuspended{nullptr, 0}, callbacks::ChapterNumber{2}}),
              (std::vector<bdmv::Callback>{callbacks::ChapterNumber{2},
                                           callbacks::SystemSuspended{nullptr, 0}}));
}

} // namespace

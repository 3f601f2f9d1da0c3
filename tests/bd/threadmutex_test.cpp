#include <gtest/gtest.h>

#include <atomic>
#include <cerrno>
#include <chrono>
#include <string>
#include <system_error>
#include <thread>
#include <type_traits>

#include "bd/threadmutex.h"
#include "mutexwatch.h"
#include "testkit/fakeplatform.h"

static_assert(!std::is_copy_constructible_v<bd::ThreadMutex>, "a mutex cannot be copied");
static_assert(!std::is_copy_assignable_v<bd::ThreadMutex>, "a mutex cannot be assigned");

namespace
{

class ThreadMutex : public testing::Test
{
protected:
    /** The error with which the calling thread fails to acquire the mutex; none if it succeeds. */
    std::error_code ErrorOfAcquire()
    {
        try {
            mutex.Acquire();
        } catch (const std::system_error& error) {
            return error.code();
        }
        return std::error_code();
    }

    template <typename Action> static void OnAnotherThread(Action action)
    {
        std::thread(action).join();
    }

    void ExpectAnotherThreadCanTakeIt()
    {
        OnAnotherThread([this] {
            EXPECT_EQ(std::error_code(), ErrorOfAcquire());
            mutex.Release();
        });
    }

    /** Whether exactly one assertion has been reported since the last check. */
    bool WasReportedOnce()
    {
        const std::string text = journal.Take();
        return text.find("assert: ") == 0 && text.find('\n') == text.size() - 1;
    }

    bdmvtest::Journal journal;
    bdmvtest::FakePlatform platform{&journal};
    const bd::ThreadMutex mutex;
};

const std::errc Deadlock = std::errc::resource_deadlock_would_occur;

} // namespace

TEST_F(ThreadMutex, IsAcquiredAndReleasedThroughAConstReference)
{
    mutex.Acquire();
    mutex.Release();

    ExpectAnotherThreadCanTakeIt();
    EXPECT_EQ("", journal.Take());
}

TEST_F(ThreadMutex, CanBeAcquiredAgainAfterRelease)
{
    mutex.Acquire();
    mutex.Release();

    EXPECT_EQ(std::error_code(), ErrorOfAcquire());
    mutex.Release();
    EXPECT_EQ("", journal.Take());
}

TEST_F(ThreadMutex, LocksAndUnlocksTheSystemMutexOnce)
{
    const std::size_t locks = bdmvtest::CountMutexLocks();
    const std::size_t unlocks = bdmvtest::CountMutexUnlocks();
    mutex.Acquire();
    EXPECT_EQ(locks + 1, bdmvtest::CountMutexLocks());
    EXPECT_EQ(unlocks, bdmvtest::CountMutexUnlocks());
    mutex.Release();
    EXPECT_EQ(locks + 1, bdmvtest::CountMutexLocks());
    EXPECT_EQ(unlocks + 1, bdmvtest::CountMutexUnlocks());
}

TEST_F(ThreadMutex, AnotherThreadWaitsUntilItIsFree)
{
    std::atomic<bool> waits{false};
    std::atomic<bool> released{false};
    bool cameAfterRelease = false;
    mutex.Acquire();
    std::thread other([&] {
        waits = true;
        mutex.Acquire();
        cameAfterRelease = released;
        mutex.Release();
    });
    while (!waits) {
        std::this_thread::yield();
    }
    std::this_thread::sleep_for(std::chrono::milliseconds(50));
    released = true;
    mutex.Release();
    other.join();

    EXPECT_TRUE(cameAfterRelease);
}

TEST_F(ThreadMutex, OneThreadAtATimeHoldsIt)
{
    const int turns = 10000;
    int number = 0;
    const auto count = [this, &number] {
        for (int turn = 0; turn < turns; ++turn) {
            mutex.Acquire();
            ++number;
            mutex.Release();
        }
    };
    std::thread other(count);
    count();
    other.join();

    EXPECT_EQ(2 * turns, number);
}

TEST_F(ThreadMutex, AcquiringTwiceOnOneThreadIsRefused)
{
    mutex.Acquire();

    EXPECT_EQ(Deadlock, ErrorOfAcquire());
    mutex.Release();
}

TEST_F(ThreadMutex, ErrorOfAcquiringTwiceNamesTheMutexAndTheReason)
{
    mutex.Acquire();

    try {
        mutex.Acquire();
        ADD_FAILURE() << "not refused";
    } catch (const std::system_error& error) {
        const std::string what = error.what();
        EXPECT_EQ(0u, what.find("bd::ThreadMutex: the calling thread holds it already:")) << what;
    }
    mutex.Release();
}

TEST_F(ThreadMutex, AcquiringTwiceNeverReachesTheOperatingSystem)
{
    mutex.Acquire();
    const std::size_t locks = bdmvtest::CountMutexLocks();
    const std::size_t unlocks = bdmvtest::CountMutexUnlocks();

    EXPECT_EQ(Deadlock, ErrorOfAcquire());
    EXPECT_EQ(locks, bdmvtest::CountMutexLocks());
    EXPECT_EQ(unlocks, bdmvtest::CountMutexUnlocks());
    mutex.Release();
}

TEST_F(ThreadMutex, RefusalLeavesItHeld)
{
    mutex.Acquire();
    EXPECT_EQ(Deadlock, ErrorOfAcquire());

    EXPECT_EQ(Deadlock, ErrorOfAcquire());
    mutex.Release();
    EXPECT_EQ("", journal.Take());
}

TEST_F(ThreadMutex, OneReleaseFreesItAfterARefusal)
{
    mutex.Acquire();
    EXPECT_EQ(Deadlock, ErrorOfAcquire());
    mutex.Release();

    ExpectAnotherThreadCanTakeIt();
    EXPECT_EQ("", journal.Take());
}

TEST_F(ThreadMutex, ReleaseByAThreadThatDoesNotHoldItIsReported)
{
    mutex.Acquire();
    OnAnotherThread([this] { EXPECT_NO_THROW(mutex.Release()); });

    EXPECT_TRUE(WasReportedOnce());
    mutex.Release();
}

TEST_F(ThreadMutex, ReleaseByAThreadThatDoesNotHoldItLeavesItHeld)
{
    mutex.Acquire();
    OnAnotherThread([this] {
        mutex.Release();
        // The journal locks its own mutex for the report.
        EXPECT_EQ(bdmvtest::CountMutexLocks(), bdmvtest::CountMutexUnlocks());
    });
    journal.Take();

    EXPECT_EQ(Deadlock, ErrorOfAcquire());
    mutex.Release();
    EXPECT_EQ("", journal.Take());
    ExpectAnotherThreadCanTakeIt();
}

TEST_F(ThreadMutex, ReleaseWhileFreeIsReported)
{
    EXPECT_NO_THROW(mutex.Release());

    EXPECT_TRUE(WasReportedOnce());
}

TEST_F(ThreadMutex, ReleaseWhileFreeLeavesItFree)
{
    OnAnotherThread([this] {
        mutex.Release();
        // The journal locks its own mutex for the report.
        EXPECT_EQ(bdmvtest::CountMutexLocks(), bdmvtest::CountMutexUnlocks());
    });
    journal.Take();

    ExpectAnotherThreadCanTakeIt();
    EXPECT_EQ("", journal.Take());
}

TEST_F(ThreadMutex, ReportNamesItsFileRelativeToTheSources)
{
    mutex.Release();

    const std::string report = journal.Take();
    EXPECT_NE(std::string::npos, report.find(", bd/threadmutex.cpp:")) << report;
}

TEST_F(ThreadMutex, RefusalOfTheOperatingSystemToLockIsThrownWithItsCode)
{
    for (const int code : {EAGAIN, EINVAL, EDEADLK}) {
        bdmvtest::FailMutexLock(code);
        const std::error_code error = ErrorOfAcquire();

        EXPECT_EQ(code, error.value());
        EXPECT_EQ(static_cast<std::errc>(code), error);
    }
}

TEST_F(ThreadMutex, RefusalOfTheOperatingSystemToLockLeavesItFree)
{
    bdmvtest::FailMutexLock(EAGAIN);
    EXPECT_NE(std::error_code(), ErrorOfAcquire());

    EXPECT_EQ(std::error_code(), ErrorOfAcquire());
    mutex.Release();
    EXPECT_EQ("", journal.Take());
    ExpectAnotherThreadCanTakeIt();
}

TEST_F(ThreadMutex, RefusalOfTheOperatingSystemToLockLeavesItToItsOwner)
{
    mutex.Acquire();
    OnAnotherThread([this] {
        bdmvtest::FailMutexLock(EAGAIN);
        EXPECT_EQ(std::errc::resource_unavailable_try_again, ErrorOfAcquire());
    });

    EXPECT_EQ(Deadlock, ErrorOfAcquire());
    mutex.Release();
    EXPECT_EQ("", journal.Take());
}

TEST_F(ThreadMutex, RefusalOfTheOperatingSystemToUnlockIsReported)
{
    mutex.Acquire();
    bdmvtest::FailMutexUnlock(EPERM);
    EXPECT_NO_THROW(mutex.Release());

    EXPECT_TRUE(WasReportedOnce());
    mutex.Release();
}

TEST_F(ThreadMutex, RefusalOfTheOperatingSystemToUnlockLeavesItHeld)
{
    mutex.Acquire();
    bdmvtest::FailMutexUnlock(EPERM);
    mutex.Release();
    journal.Take();

    EXPECT_EQ(Deadlock, ErrorOfAcquire());
    mutex.Release();
    EXPECT_EQ("", journal.Take());
    ExpectAnotherThreadCanTakeIt();
}

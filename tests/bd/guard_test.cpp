#include <gtest/gtest.h>

#include <cstring>
#include <stdexcept>
#include <string>
#include <system_error>
#include <type_traits>

#include "bd/guard.h"
#include "bd/threadmutex.h"
#include "testkit/fakeplatform.h"

namespace
{

/** Records its calls. */
class FakeLock
{
public:
    void Acquire() const
    {
        calls += "acquire ";
        if (refuses) {
            throw std::runtime_error("refused");
        }
    }

    void Release() const { calls += "release "; }

    bool refuses = false;
    mutable std::string calls;
};

typedef bd::Guard<FakeLock> FakeGuard;
typedef bd::Guard<bd::ThreadMutex> MutexGuard;

template <typename GuardType>
constexpr bool IsCopied =
    std::is_copy_constructible_v<GuardType> || std::is_copy_assignable_v<GuardType> ||
    std::is_move_constructible_v<GuardType> || std::is_move_assignable_v<GuardType>;

static_assert(!IsCopied<FakeGuard> && !IsCopied<MutexGuard>, "a guard belongs to its scope");
static_assert(!std::is_default_constructible_v<MutexGuard>, "a guard needs a lock");

} // namespace

TEST(Guard, AcquiresAndReleasesOnce)
{
    const FakeLock lock;
    {
        const FakeGuard guard(lock);
        EXPECT_EQ("acquire ", lock.calls);
    }

    EXPECT_EQ("acquire release ", lock.calls);
}

TEST(Guard, ReleasesWhenAnExceptionLeavesItsScope)
{
    const FakeLock lock;
    try {
        const FakeGuard guard(lock);
        throw 1;
    } catch (int) {
    }

    EXPECT_EQ("acquire release ", lock.calls);
}

TEST(Guard, ReleasesEarly)
{
    const FakeLock lock;
    FakeGuard guard(lock);
    guard.Release();

    EXPECT_EQ("acquire release ", lock.calls);
}

TEST(Guard, DoesNotReleaseAgainAfterAnEarlyRelease)
{
    const FakeLock lock;
    {
        FakeGuard guard(lock);
        guard.Release();
        guard.Release();
    }

    EXPECT_EQ("acquire release ", lock.calls);
}

TEST(Guard, ReleasesAgainAfterAcquiringAgain)
{
    const FakeLock lock;
    {
        FakeGuard guard(lock);
        guard.Release();
        guard.Acquire();
        EXPECT_EQ("acquire release acquire ", lock.calls);
    }

    EXPECT_EQ("acquire release acquire release ", lock.calls);
}

TEST(Guard, DoesNotReleaseALockItFailedToAcquire)
{
    FakeLock lock;
    lock.refuses = true;

    EXPECT_THROW(FakeGuard guard(lock), std::runtime_error);
    EXPECT_EQ("acquire ", lock.calls);
}

TEST(Guard, DoesNotReleaseALockItFailedToAcquireAgain)
{
    FakeLock lock;
    {
        FakeGuard guard(lock);
        guard.Release();
        lock.refuses = true;
        EXPECT_THROW(guard.Acquire(), std::runtime_error);
    }

    EXPECT_EQ("acquire release acquire ", lock.calls);
}

TEST(Guard, ReleasesTheHeldLockAfterFailingToAcquireItTwice)
{
    FakeLock lock;
    {
        FakeGuard guard(lock);
        lock.refuses = true;
        EXPECT_THROW(guard.Acquire(), std::runtime_error);
    }

    EXPECT_EQ("acquire acquire release ", lock.calls);
}

TEST(Guard, HoldsTheLockThenTheFlag)
{
    const FakeLock lock;
    FakeGuard guard(lock);
    const void* first = nullptr;
    bool acquired = false;
    ASSERT_EQ(2 * sizeof(void*), sizeof(guard));
    const auto look = [&] {
        std::memcpy(&first, static_cast<const void*>(&guard), sizeof(first));
        std::memcpy(&acquired, reinterpret_cast<const char*>(&guard) + sizeof(first), 1);
    };

    look();
    EXPECT_EQ(&lock, first);
    EXPECT_TRUE(acquired);
    guard.Release();
    look();
    EXPECT_FALSE(acquired);
}

TEST(Guard, HoldsAThreadMutexForItsScope)
{
    bdmvtest::Journal journal;
    const bdmvtest::FakePlatform platform(&journal);
    const bd::ThreadMutex mutex;
    {
        const MutexGuard guard(mutex);
        EXPECT_THROW(mutex.Acquire(), std::system_error);
    }
    EXPECT_NO_THROW(mutex.Acquire());
    mutex.Release();

    EXPECT_EQ("", journal.Take());
}

TEST(Guard, LeavesAThreadMutexItFailedToAcquireToItsHolder)
{
    bdmvtest::Journal journal;
    const bdmvtest::FakePlatform platform(&journal);
    const bd::ThreadMutex mutex;
    const MutexGuard holder(mutex);

    EXPECT_THROW(MutexGuard guard(mutex), std::system_error);
    EXPECT_THROW(mutex.Acquire(), std::system_error);
    EXPECT_EQ("", journal.Take());
}

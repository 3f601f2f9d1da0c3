#include <gtest/gtest.h>

#include <atomic>
#include <thread>
#include <utility>
#include <vector>

#include "bd/refptr.h"

namespace
{

/** Counts its destructions, and reads the values that its sharers have written. */
struct Shared {
    Shared(std::atomic<int>& destroyed, std::atomic<long>& sum)
        : written{0, 0}, m_rDestroyed(destroyed), m_rSum(sum)
    {
    }

    virtual ~Shared()
    {
        m_rSum += written[0] + written[1];
        ++m_rDestroyed;
    }

    Shared(const Shared&) = delete;
    Shared& operator=(const Shared&) = delete;

    long written[2];

private:
    std::atomic<int>& m_rDestroyed;
    std::atomic<long>& m_rSum;
};

/** Starts two threads at about the same moment. */
class StartingLine
{
public:
    void Wait()
    {
        ++m_Waiting;
        while (m_Waiting < 2) {
            std::this_thread::yield();
        }
    }

private:
    std::atomic<int> m_Waiting{0};
};

} // namespace

TEST(RefPtrThreads, ConcurrentReleasesDestroyTheObjectOnce)
{
    const int rounds = 500;
    std::atomic<int> destroyed{0};
    std::atomic<long> sum{0};
    for (int round = 0; round < rounds; ++round) {
        bd::RefPtr<Shared> first(new Shared(destroyed, sum));
        bd::RefPtr<Shared> second(first);
        StartingLine line;
        std::thread other([&second, &line] {
            second->written[1] = 1;
            line.Wait();
            second.Release();
        });
        first->written[0] = 2;
        line.Wait();
        first.Release();
        other.join();
    }

    EXPECT_EQ(rounds, destroyed);
    EXPECT_EQ(3L * rounds, sum);
}

TEST(RefPtrThreads, CopiesAndReleasesOnManyThreadsAreAllCounted)
{
    std::atomic<int> destroyed{0};
    std::atomic<long> sum{0};
    bd::RefPtr<Shared> pointer(new Shared(destroyed, sum));
    std::vector<std::thread> threads;
    for (int i = 0; i < 4; ++i) {
        threads.emplace_back([copy = pointer]() mutable {
            for (int turn = 0; turn < 2000; ++turn) {
                bd::RefPtr<Shared> another(copy);
                bd::RefPtr<Shared> assigned;
                assigned = another;
                EXPECT_GE(assigned.GetCount(), 3);
                copy = std::move(another);
            }
        });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
    threads.clear();

    EXPECT_EQ(1, pointer.GetCount());
    EXPECT_EQ(0, destroyed);
    pointer.Release();
    EXPECT_EQ(1, destroyed);
}

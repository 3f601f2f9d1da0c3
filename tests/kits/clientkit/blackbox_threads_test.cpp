// Several threads dump a box while another one delivers to it.

#include <gtest/gtest.h>

#include <array>
#include <atomic>
#include <cstdio>
#include <string>
#include <thread>
#include <vector>

#include "clientkit/blackbox.h"

namespace bdmvtest
{
namespace
{

constexpr unsigned Callbacks = 3000;
constexpr int Dumps = 200;

/** The number of the callback that is being delivered; read on the delivering thread. */
unsigned g_Number = 0;

std::uint64_t NumberAsTicks()
{
    return g_Number;
}

/** Checks the lines of a dump; one piece each, since they are short. */
struct Checker {
    bool isFirst = true;
    unsigned long long next = 0; ///< the number of the callback that must follow
    unsigned long long lines = 0;
    std::string fault;

    static void Check(void* user, const char* bytes, std::size_t size)
    {
        static_cast<Checker*>(user)->CheckLine(std::string(bytes, size));
    }

    void CheckLine(const std::string& line)
    {
        unsigned long long ticks = 0;
        unsigned long long value = 0;
        std::array<char, 32> text{};
        if (std::sscanf(line.c_str(), "{\"ticks\":%llu,\"gap\":{\"lost\":%llu,\"cause\":\"%31[a-z]",
                        &ticks, &value, text.data()) == 3) {
            next += value;
            const std::string cause = text.data();
            Expect(cause == "overwritten" || (isFirst && cause == "capacity"), line);
            Expect(ticks >= next, line);
        } else if (std::sscanf(line.c_str(), "{\"ticks\":%llu,%*[^{]{\"position\":%llu}}", &ticks,
                               &value) == 2) {
            Expect(ticks == next && value == next, line);
            ++next;
            ++lines;
        } else if (std::sscanf(line.c_str(), "{\"ticks\":%llu,%*[^{]{\"data\":\"%31[^,]", &ticks,
                               text.data()) == 2) {
            const std::string digits = text.data();
            // Nothing if the block was overwritten after its record had been copied.
            Expect(ticks == next && (digits.size() == 17 || digits == "\""), line);
            for (std::size_t i = 2; i + 1 < digits.size(); ++i) {
                Expect(digits[i] == digits[i - 2], line);
            }
            ++next;
            ++lines;
        } else {
            Expect(false, line);
        }
        isFirst = false;
    }

    void Expect(bool condition, const std::string& line)
    {
        if (!condition && fault.empty()) {
            fault = "before " + std::to_string(next) + ": " + line;
        }
    }
};

TEST(BlackBoxThreads, DumpWholeRecordsAndCountWhatTheyLose)
{
    bdmv::BlackBox box(16, NumberAsTicks, 8);
    std::atomic<int> dumping{2};

    const auto dumpOften = [&box, &dumping] {
        for (int i = 0; i < Dumps; ++i) {
            Checker checker;
            box.Dump(Checker::Check, &checker);
            EXPECT_EQ(checker.fault, "");
            EXPECT_LE(checker.lines, 16u);
        }
        --dumping;
    };
    std::thread first(dumpOften);
    std::thread second(dumpOften);
    for (g_Number = 0; g_Number < Callbacks || dumping != 0; ++g_Number) {
        if (g_Number % 4 == 3) {
            const std::array<bd::UInt8, 8> block = [] {
                std::array<bd::UInt8, 8> bytes{};
                bytes.fill(static_cast<bd::UInt8>(g_Number));
                return bytes;
            }();
            box.SystemSuspended(block.data(), 8);
        } else {
            box.CurrentTimePosition(g_Number);
        }
    }
    first.join();
    second.join();

    Checker checker;
    box.Dump(Checker::Check, &checker);
    EXPECT_EQ(checker.fault, "");
    EXPECT_EQ(checker.lines, 16u);
    EXPECT_EQ(checker.next, g_Number);
}

TEST(BlackBoxThreads, MayDeliverAtOnce)
{
    struct Clock {
        static std::uint64_t Ticks() { return 0; }
    };
    bdmv::BlackBox box(2 * Callbacks, Clock::Ticks);
    const auto deliver = [&box] {
        for (unsigned i = 0; i < Callbacks; ++i) {
            box.Paused();
        }
    };
    std::thread first(deliver);
    std::thread second(deliver);
    first.join();
    second.join();

    unsigned lines = 0;
    box.Dump([](void* user, const char*, std::size_t) { ++*static_cast<unsigned*>(user); }, &lines);
    EXPECT_EQ(lines, 2 * Callbacks);
}

} // namespace
} // namespace bdmvtest

/**
 * @file
 * A clock and texts for tests of the black box.
 */
#ifndef TESTS_KITS_CLIENTKIT_BOXTEST_H
#define TESTS_KITS_CLIENTKIT_BOXTEST_H

#include <gtest/gtest.h>

#include <cstdint>
#include <initializer_list>
#include <string>

#include "clientkit/blackbox.h"

namespace bdmvtest
{

/** Appends a piece to a std::string. */
inline void AppendTo(void* text, const char* bytes, std::size_t size)
{
    static_cast<std::string*>(text)->append(bytes, size);
}

inline std::string DumpOf(const bdmv::BlackBox& box)
{
    std::string text;
    box.Dump(AppendTo, &text);
    return text;
}

/** A clock that tests set; it starts at zero for each of them. */
class BoxTest : public testing::Test
{
public:
    BoxTest() { s_Ticks = 0; }

    static std::uint64_t Ticks() { return s_Ticks; }

    /** A callback with this number, delivered at that many seconds. */
    static void Deliver(bdmv::INavigatorListener& listener, bd::UInt16 number)
    {
        s_Ticks = std::uint64_t{45000} * number;
        listener.ChapterNumber(number);
    }

    static void Deliver(bdmv::INavigatorListener& listener,
                        std::initializer_list<bd::UInt16> numbers)
    {
        for (const bd::UInt16 number : numbers) {
            Deliver(listener, number);
        }
    }

    /** The line of such a callback. */
    static std::string LineOf(bd::UInt16 number)
    {
        const std::string digits = std::to_string(number);
        return "{\"ticks\":" + std::to_string(45000 * number) +
               ",\"time\":\"00:00:" + (number < 10 ? "0" : "") + digits +
               ".000\",\"interface\":\"settings\",\"callback\":\"ChapterNumber\","
               "\"arguments\":{\"chapter\":" +
               digits + "}}\n";
    }

    /** The line of a gap before such a callback. */
    static std::string GapOf(std::uint64_t lost, const std::string& cause, bd::UInt16 before)
    {
        return "{\"ticks\":" + std::to_string(45000 * before) +
               ",\"gap\":{\"lost\":" + std::to_string(lost) + ",\"cause\":\"" + cause + "\"}}\n";
    }

    static std::uint64_t s_Ticks;
};

inline std::uint64_t BoxTest::s_Ticks = 0;

} // namespace bdmvtest

#endif

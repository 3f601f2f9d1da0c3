// All operations at once, from several threads; run under ThreadSanitizer as well.
#include <algorithm>
#include <atomic>
#include <string>
#include <thread>
#include <vector>

#include "porttesting.h"

namespace
{

using porttesting::ReadFile;
using porttesting::ReadLines;
using porttesting::TextOf;

constexpr int WriterCount = 3;
constexpr int LinesPerWriter = 1500;

TEST(Threads, LoseNoLineWhileTheSinkIsChanged)
{
    const porttesting::TemporaryDirectory directory;
    const std::string first = directory.Path("first");
    const std::string second = directory.Path("second");
    const KEVRO_UInt64 before = KEVRO_Log_GetDroppedLines();
    porttesting::ConfigureSink("file:" + first);

    std::atomic<int> writing{WriterCount};
    std::vector<std::thread> threads;
    for (int writer = 0; writer < WriterCount; ++writer) {
        threads.emplace_back([&writing, writer] {
            for (int line = 0; line < LinesPerWriter; ++line) {
                porttesting::EventLogger().Log("%d/%d", writer, line);
            }
            --writing;
        });
    }
    threads.emplace_back([&] {
        KEVRO_UInt64 last = 0;
        for (int mark = 0; writing != 0; ++mark) {
            porttesting::EventLogger().Log("mark %d.", mark);
            KEVRO_Log_Flush();
            const std::string text = "mark " + std::to_string(mark) + ".";
            EXPECT_TRUE(ReadFile(first).find(text) != std::string::npos ||
                        ReadFile(second).find(text) != std::string::npos)
                << text;
            const KEVRO_UInt64 dropped = KEVRO_Log_GetDroppedLines();
            EXPECT_GE(dropped, last);
            last = dropped;
        }
    });
    while (writing != 0) {
        // The queue is larger than the number of lines, so none may be dropped.
        porttesting::ConfigureSink("file:" + second +
                                   ",queue=" + std::to_string(2 * WriterCount * LinesPerWriter));
        porttesting::ConfigureSink("file:" + first);
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
    porttesting::ConfigureSink("stderr");

    std::vector<std::string> written;
    for (const std::string& file : {first, second}) {
        for (const std::string& line : ReadLines(file)) {
            if (TextOf(line).rfind("mark", 0) != 0) {
                written.push_back(TextOf(line));
            }
        }
    }
    std::vector<std::string> expected;
    for (int writer = 0; writer < WriterCount; ++writer) {
        for (int line = 0; line < LinesPerWriter; ++line) {
            expected.push_back(std::to_string(writer) + "/" + std::to_string(line));
        }
    }
    std::sort(written.begin(), written.end());
    std::sort(expected.begin(), expected.end());
    EXPECT_EQ(written, expected);
    EXPECT_EQ(KEVRO_Log_GetDroppedLines(), before);
}

TEST(Threads, CountEveryLineThatIsNotWritten)
{
    const porttesting::TemporaryDirectory directory;
    const std::string file = directory.Path("log");
    const KEVRO_UInt64 before = KEVRO_Log_GetDroppedLines();
    porttesting::ConfigureSink("file:" + file + ",queue=1");
    std::vector<std::thread> threads;
    for (int writer = 0; writer < WriterCount; ++writer) {
        threads.emplace_back([] {
            for (int line = 0; line < LinesPerWriter; ++line) {
                porttesting::EventLogger().Log("line");
            }
        });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
    porttesting::ConfigureSink("stderr");

    const auto lines = ReadLines(file);
    const auto written = std::count_if(
        lines.begin(), lines.end(), [](const std::string& line) { return TextOf(line) == "line"; });
    EXPECT_EQ(KEVRO_Log_GetDroppedLines() - before,
              static_cast<KEVRO_UInt64>(WriterCount * LinesPerWriter - written));
}

TEST(Threads, NeverFindALineOffThatBothConfigurationsSwitchOn)
{
    ASSERT_TRUE(KEVRO_Log_Configure("BdmvNavigator=Event|Info", nullptr, 0));
    std::atomic<bool> stop{false};
    std::vector<std::thread> readers;
    for (int reader = 0; reader < 2; ++reader) {
        readers.emplace_back([&stop] {
            while (!stop) {
                ASSERT_NE(KEVRO_Log_IsEnabled(bd::CompIdBdmvNavigator, KEVRO_Log_LevelEvent, 0), 0);
            }
        });
    }
    std::vector<std::thread> configurers;
    for (int configurer = 0; configurer < 2; ++configurer) {
        configurers.emplace_back([] {
            for (int i = 0; i < 2000; ++i) {
                KEVRO_Log_Configure("*=Fatal,BdmvNavigator=Event", nullptr, 0);
                KEVRO_Log_Configure("BdmvNavigator=Event|Info,*=Info", nullptr, 0);
            }
        });
    }
    for (std::thread& configurer : configurers) {
        configurer.join();
    }
    stop = true;
    for (std::thread& reader : readers) {
        reader.join();
    }
    EXPECT_TRUE(KEVRO_Log_Configure("*=Exception|Warning|Fatal", nullptr, 0));
}

TEST(Threads, LeaveOneConfigurationInForceNotAMixture)
{
    constexpr int Rounds = 10000;
    porttesting::StartLine line(2);
    std::thread other([&] {
        for (int round = 0; round < Rounds; ++round) {
            line.Wait();
            KEVRO_Log_Configure("*=Event", nullptr, 0);
            line.Wait();
        }
    });
    int mixtures = 0;
    for (int round = 0; round < Rounds; ++round) {
        line.Wait();
        KEVRO_Log_Configure("*=Info+hifreq", nullptr, 0);
        line.Wait();
        const auto hasInfo = [](KEVRO_UInt32 component) {
            return KEVRO_Log_IsEnabled(component, KEVRO_Log_LevelInfo, 1) != 0;
        };
        for (KEVRO_UInt32 component = bd::CompIdBdavArchiver; component < bd::CompId__sizeof;
             ++component) {
            mixtures += hasInfo(component) != hasInfo(bd::CompId__sizeof) ? 1 : 0;
        }
    }
    other.join();
    EXPECT_EQ(mixtures, 0);
    EXPECT_TRUE(KEVRO_Log_Configure("*=Exception|Warning|Fatal", nullptr, 0));
}

} // namespace

// The lines that wait for a destination.
#include "logqueue.h"

#include <memory>
#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace
{

using kevro::LogQueue;
using kevro::QueuedLine;

/** Returns whether the oldest line was dropped. */
bool Append(LogQueue& queue, const std::string& text)
{
    QueuedLine& line = queue.Next();
    line.text.append(text.data(), text.data() + text.size());
    return queue.Append();
}

std::vector<std::string> TakeAll(LogQueue& queue)
{
    std::vector<std::string> texts;
    auto pLine = std::make_unique<QueuedLine>();
    while (queue.Size() != 0) {
        queue.Take(pLine);
        texts.emplace_back(pLine->text.data(), pLine->text.size());
    }
    return texts;
}

TEST(LogQueue, ReturnsItsLinesInTheirOrder)
{
    LogQueue queue(3);
    for (int round = 0; round < 3; ++round) { // begins at another place each time
        EXPECT_FALSE(Append(queue, "1"));
        EXPECT_FALSE(Append(queue, "2"));
        EXPECT_EQ(queue.Size(), 2U);
        EXPECT_EQ(TakeAll(queue), (std::vector<std::string>{"1", "2"}));
    }
}

TEST(LogQueue, DropsTheOldestLineOnceItsNumberOfLinesWaits)
{
    LogQueue queue(3);
    EXPECT_FALSE(Append(queue, "1"));
    EXPECT_FALSE(Append(queue, "2"));
    EXPECT_FALSE(Append(queue, "3"));
    EXPECT_TRUE(Append(queue, "4"));
    EXPECT_TRUE(Append(queue, "5"));
    EXPECT_EQ(queue.Size(), 3U);
    EXPECT_EQ(TakeAll(queue), (std::vector<std::string>{"3", "4", "5"}));
}

TEST(LogQueue, KeepsALineThatWasTakenWhileOthersAreAppended)
{
    LogQueue queue(1);
    Append(queue, "taken");
    auto pLine = std::make_unique<QueuedLine>();
    queue.Take(pLine);
    Append(queue, "2");
    Append(queue, "3");
    Append(queue, "4");
    EXPECT_EQ(std::string(pLine->text.data(), pLine->text.size()), "taken");
    EXPECT_EQ(TakeAll(queue), (std::vector<std::string>{"4"}));
}

TEST(LogQueue, ForgetsALineThatWasNotAppended)
{
    LogQueue queue(2);
    Append(queue, "1");
    queue.Next().text.push_back('x');
    EXPECT_EQ(queue.Size(), 1U);
    Append(queue, "2");
    EXPECT_EQ(TakeAll(queue), (std::vector<std::string>{"1", "2"}));
}

} // namespace

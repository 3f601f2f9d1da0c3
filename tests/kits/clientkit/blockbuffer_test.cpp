// A ring of bytes that keeps copies of blocks.

#include "clientkit/blockbuffer.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <deque>
#include <limits>
#include <numeric>
#include <random>
#include <stdexcept>
#include <string>
#include <vector>

#include "testkit/allocationcounter.h"

namespace
{

using bdmv::BlockBuffer;
typedef std::vector<unsigned char> Bytes;

constexpr std::size_t Largest = 64; // a multiple of every alignment

/** Blocks in a buffer, and what they must contain. */
class Blocks
{
public:
    explicit Blocks(std::size_t blocks) : m_Buffer(blocks, Largest) {}

    /** Adds a block whose bytes differ from those of the block before; false when there is no room.
     */
    bool Add(std::size_t size)
    {
        Bytes bytes(size);
        std::iota(bytes.begin(), bytes.end(), ++m_Next);
        const void* const copy = m_Buffer.Add(bytes.data(), size);
        if (copy != nullptr) {
            EXPECT_EQ(reinterpret_cast<std::uintptr_t>(copy) % alignof(std::max_align_t), 0U);
            m_Blocks.push_back({copy, bytes});
        }
        return copy != nullptr;
    }

    /** Removes the oldest block, after a comparison of all. */
    void Remove()
    {
        for (const Block& block : m_Blocks) {
            const auto* const begin = static_cast<const unsigned char*>(block.copy);
            EXPECT_EQ(Bytes(begin, begin + block.bytes.size()), block.bytes);
        }
        m_Buffer.Remove(m_Blocks.front().copy, m_Blocks.front().bytes.size());
        m_Blocks.pop_front();
    }

    bool AreEmpty() const { return m_Blocks.empty(); }

private:
    struct Block {
        const void* copy;
        Bytes bytes;
    };

    BlockBuffer m_Buffer;
    std::deque<Block> m_Blocks;
    unsigned char m_Next = 0;
};

} // namespace

TEST(BlockBuffer, KeepsCopies)
{
    BlockBuffer buffer(1, 4);
    std::string bytes = "abcd";
    const void* const copy = buffer.Add(bytes.data(), 4);
    bytes = "....";
    EXPECT_EQ(std::string(static_cast<const char*>(copy), 4), "abcd");
}

TEST(BlockBuffer, RefusesABlockLargerThanTheLargest)
{
    Blocks blocks(4);
    EXPECT_FALSE(blocks.Add(Largest + 1));
    EXPECT_TRUE(blocks.Add(Largest));
}

TEST(BlockBuffer, OfSizeZeroRefusesEveryBlock)
{
    BlockBuffer buffer(4, 0);
    EXPECT_EQ(buffer.Add("a", 1), nullptr);
}

TEST(BlockBuffer, RefusesMoreBytesThanCanBeAddressed)
{
    constexpr std::size_t Most = std::numeric_limits<std::size_t>::max();
    EXPECT_THROW(BlockBuffer(1, Most), std::length_error);
    EXPECT_THROW(BlockBuffer(2, Most / 2), std::length_error); // more only when rounded up
    EXPECT_THROW(BlockBuffer(4, Most / 4 + 1), std::length_error);
    EXPECT_THROW(BlockBuffer(Most, 2), std::length_error);
    EXPECT_NO_THROW(BlockBuffer(0, Most - Most % alignof(std::max_align_t)));
}

TEST(BlockBuffer, HasRoomForItsNumberOfLargestBlocks)
{
    Blocks blocks(3);
    EXPECT_TRUE(blocks.Add(Largest));
    EXPECT_TRUE(blocks.Add(Largest));
    EXPECT_TRUE(blocks.Add(Largest));
    EXPECT_FALSE(blocks.Add(1));
}

TEST(BlockBuffer, ReusesTheRoomOfTheOldestBlock)
{
    Blocks blocks(3);
    blocks.Add(Largest);
    blocks.Add(Largest);
    blocks.Add(Largest);
    for (int i = 0; i < 10; ++i) {
        blocks.Remove();
        EXPECT_TRUE(blocks.Add(Largest));
        EXPECT_FALSE(blocks.Add(1));
    }
}

TEST(BlockBuffer, DoesNotSplitABlock)
{
    Blocks blocks(2);
    blocks.Add(Largest / 2);
    blocks.Add(Largest);
    blocks.Remove(); // half a block is free at either end
    EXPECT_FALSE(blocks.Add(Largest));
    EXPECT_TRUE(blocks.Add(Largest / 2));
    EXPECT_TRUE(blocks.Add(Largest / 2));
    EXPECT_FALSE(blocks.Add(1));
}

TEST(BlockBuffer, BeginsAnewWhenTheLastBlockIsRemoved)
{
    Blocks blocks(1);
    blocks.Add(Largest / 2);
    blocks.Remove();
    EXPECT_TRUE(blocks.Add(Largest));
}

TEST(BlockBuffer, OfFourAlwaysHasRoomForTheSecondOfTwoLargestBlocks)
{
    for (std::size_t position = 0; position <= 3 * Largest; position += Largest / 4) {
        Blocks blocks(4);
        int before = 0;
        for (std::size_t rest = position; rest > 0; rest -= Largest / 4) {
            blocks.Add(Largest / 4);
            ++before;
        }
        EXPECT_TRUE(blocks.Add(Largest)) << position;
        for (; before > 0; --before) {
            blocks.Remove();
        }
        EXPECT_TRUE(blocks.Add(Largest)) << position;
    }
}

TEST(BlockBuffer, KeepsRandomBlocksIntact)
{
    std::mt19937 random(11);
    Blocks blocks(4);
    int refused = 0;
    for (int i = 0; i < 5000; ++i) {
        if (blocks.AreEmpty() || random() % 2 == 0) {
            refused += blocks.Add(1 + random() % Largest) ? 0 : 1;
        } else {
            blocks.Remove();
        }
    }
    EXPECT_GT(refused, 100);
    EXPECT_LT(refused, 2000);
}

TEST(BlockBuffer, DoesNotAllocateAfterConstruction)
{
    BlockBuffer buffer(2, 4);
    const std::size_t before = bdmvtest::CountAllocations();
    const void* const copy = buffer.Add("abcd", 4);
    buffer.Remove(copy, 4);
    EXPECT_EQ(bdmvtest::CountAllocations(), before);
}

#include "navigator/resumedata.h"

namespace deskplayer
{

namespace
{

constexpr std::uint32_t Magic = 0x42445231; // "BDR1"

/** FNV-1a: detects damage to a stored block. */
std::uint32_t ChecksumOf(const bd::UInt8* bytes, std::size_t size)
{
    std::uint32_t sum = 2166136261U;
    for (std::size_t i = 0; i < size; ++i) {
        sum = (sum ^ bytes[i]) * 16777619U;
    }
    return sum;
}

class Writer
{
public:
    template <typename Number> void operator()(const Number& value)
    {
        for (std::size_t byte = sizeof(Number); byte-- > 0;) {
            m_Block.push_back(
                static_cast<bd::UInt8>(static_cast<std::uint64_t>(value) >> (8 * byte)));
        }
    }

    void operator()(Ticks time) { (*this)(time.count()); }

    std::vector<bd::UInt8>& Block() { return m_Block; }

private:
    std::vector<bd::UInt8> m_Block;
};

class Reader
{
public:
    explicit Reader(const std::vector<bd::UInt8>& block) : m_rBlock(block) {}

    template <typename Number> void operator()(Number& value)
    {
        std::uint64_t number = 0;
        for (std::size_t byte = 0; byte < sizeof(Number); ++byte) {
            number = number << 8 | m_rBlock[m_Next++];
        }
        value = static_cast<Number>(number);
    }

    void operator()(Ticks& time)
    {
        Ticks::rep count = 0;
        (*this)(count);
        time = Ticks(count);
    }

private:
    const std::vector<bd::UInt8>& m_rBlock;
    std::size_t m_Next = 0;
};

/** Visits the fields in the order of the block, for writing and for reading. */
template <typename Visitor, typename Point>
void VisitFields(Visitor& visit, std::uint32_t& magic, Point& point,
                 bd::PlayDirectionDef& direction, bd::PlaySpeedDef& speed)
{
    visit(magic);
    visit(point.playList);
    visit(point.playing);
    visit(point.playItem);
    visit(point.position);
    visit(direction);
    visit(speed);
    visit(point.selection.video);
    visit(point.selection.audio);
    visit(point.selection.ig);
    visit(point.selection.pg);
    visit(point.selection.secondaryVideo);
    visit(point.selection.secondaryAudio);
    visit(point.selection.pipPg);
    visit(point.selection.angle);
    visit(point.selection.style);
    visit(point.selection.pgShown);
    visit(point.selection.secondaryVideoShown);
    visit(point.selection.secondaryAudioShown);
    visit(point.selection.pipPgPicked);
}

} // namespace

std::vector<bd::UInt8> MakeResumeData(const ResumePoint& point)
{
    Writer write;
    std::uint32_t magic = Magic;
    bd::PlayDirectionDef direction = point.playMode.Direction();
    bd::PlaySpeedDef speed = point.playMode.Speed();
    VisitFields(write, magic, point, direction, speed);
    write(ChecksumOf(write.Block().data(), write.Block().size()));
    return write.Block();
}

std::optional<ResumePoint> ReadResumeData(const std::vector<bd::UInt8>& block)
{
    static const std::size_t size = MakeResumeData(ResumePoint()).size();
    if (block.size() != size) {
        return std::nullopt;
    }
    Reader read(block);
    std::uint32_t magic = 0;
    ResumePoint point;
    bd::PlayDirectionDef direction = bd::PlayDirectionForward;
    bd::PlaySpeedDef speed = bd::PlaySpeedNormal;
    VisitFields(read, magic, point, direction, speed);
    std::uint32_t checksum = 0;
    read(checksum);
    if (magic != Magic || checksum != ChecksumOf(block.data(), size - sizeof checksum)) {
        return std::nullopt;
    }
    point.playMode = bd::PlayMode(direction, speed);
    return point;
}

} // namespace deskplayer

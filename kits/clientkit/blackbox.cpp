#include "clientkit/blackbox.h"

#include <algorithm>
#include <limits>
#include <stdexcept>

#include "bd/guard.h"
#include "clientkit/jsonline.h"

namespace bdmv
{

namespace
{

std::size_t Checked(std::size_t callbacks)
{
    if (callbacks == 0) {
        throw std::invalid_argument("bdmv::BlackBox: no callbacks");
    }
    return callbacks;
}

typedef std::uint64_t (*TicksFunction)();

TicksFunction Checked(TicksFunction ticks)
{
    if (ticks == nullptr) {
        throw std::invalid_argument("bdmv::BlackBox: no clock");
    }
    return ticks;
}

std::size_t SizeOfBlocks(std::size_t callbacks, std::size_t bytesOfBlock)
{
    if (bytesOfBlock > std::numeric_limits<std::size_t>::max() / callbacks) {
        throw std::length_error("bdmv::BlackBox: too many bytes");
    }
    return callbacks * bytesOfBlock;
}

} // namespace

/** The arguments of a record: as in its callback, but for those that the record keeps apart. */
class BlackBox::Line
{
public:
    Line(const BlackBox& box, bd::UInt64 number, const Record& record, JsonLine& line)
        : m_rBox(box), m_Number(number), m_rRecord(record), m_rLine(line)
    {
    }

    template <typename Value> void operator()(const char* name, const Value& value)
    {
        m_rLine(name, value);
    }

    // A block can be of any size, so it is copied and written in parts.
    void operator()(const char* name, const Bytes& /*value*/)
    {
        m_rLine.BeginBytes(name);
        std::size_t offset = 0;
        bd::UInt8 bytes[64];
        while (const std::size_t size = m_rBox.FetchBytes(
                   m_Number, offset, bytes,
                   std::min<std::size_t>(sizeof bytes, m_rRecord.size - offset))) {
            m_rLine.AddBytes(bytes, size);
            offset += size;
        }
        m_rLine.EndBytes();
    }

    void operator()(const char* name, const IProgramData::RefPtr& /*value*/)
    {
        m_rLine(name, m_rRecord.commands);
    }

private:
    const BlackBox& m_rBox;
    const bd::UInt64 m_Number;
    const Record& m_rRecord;
    JsonLine& m_rLine;
};

BlackBox::BlackBox(std::size_t callbacks, std::uint64_t (*ticks)(), std::size_t bytesOfBlock)
    : m_pTicks(Checked(ticks)), m_BytesOfBlock(bytesOfBlock),
      m_Records(Checked(callbacks), Record{0, callbacks::PlayStarted{}, 0, 0}),
      m_Blocks(SizeOfBlocks(callbacks, bytesOfBlock)), m_Next(0), m_Received(0)
{
}

// The client's functions are called before the lock is taken: they may end in Assert(), and that in
// Dump().
void BlackBox::OnCallback(const Callback& callback)
{
    const bd::UInt64 ticks = m_pTicks();
    if (const auto* const suspended = callback.As<callbacks::SystemSuspended>()) {
        const std::size_t size =
            suspended->data == nullptr ? 0 : std::min<std::size_t>(suspended->size, m_BytesOfBlock);
        Keep(Record{ticks, callbacks::SystemSuspended{nullptr, suspended->size},
                    static_cast<bd::UInt32>(size), 0},
             suspended->data);
    } else if (const auto* const button = callback.As<callbacks::ExecuteButton>()) {
        const bd::UInt16 commands =
            button->program ? button->program->GetNumberOfNavigationCommands() : bd::UInt16(0);
        Keep(Record{ticks,
                    callbacks::ExecuteButton{button->ticket, button->buttonId,
                                             IProgramData::RefPtr()},
                    0, commands},
             nullptr);
    } else {
        Keep(Record{ticks, callback, 0, 0}, nullptr);
    }
}

void BlackBox::Keep(const Record& record, const void* block)
{
    const bd::Guard<bd::ThreadMutex> guard(m_Mutex);
    m_Records[m_Next] = record;
    std::copy_n(static_cast<const bd::UInt8*>(block), record.size,
                m_Blocks.data() + m_Next * m_BytesOfBlock);
    ++m_Received;
    if (++m_Next == m_Records.size()) {
        m_Next = 0;
    }
}

void BlackBox::Dump(void (*write)(void* user, const char* bytes, std::size_t size),
                    void* user) const
{
    Record record{0, callbacks::PlayStarted{}, 0, 0};
    const Contents contents = Fetch(0, record);
    if (contents.oldest != 0) {
        JsonLine(write, user).Gap(record.ticks, contents.oldest, "capacity");
    }
    for (bd::UInt64 next = contents.oldest; next < contents.end; ++next) {
        const bd::UInt64 oldest = Fetch(next, record).oldest;
        if (oldest > next) {
            const bd::UInt64 lost = std::min(oldest, contents.end) - next;
            JsonLine(write, user).Gap(record.ticks, lost, "overwritten");
            next = oldest;
        }
        if (next < contents.end) {
            JsonLine line(write, user);
            line.Begin(record.ticks, record.callback.Id());
            Line arguments(*this, next, record, line);
            record.callback.VisitArguments(arguments);
            line.End();
        }
    }
}

BlackBox::Contents BlackBox::Fetch(bd::UInt64 number, Record& record) const
{
    const bd::Guard<bd::ThreadMutex> guard(m_Mutex);
    const Contents contents = {Oldest(), m_Received};
    record = m_Records[PlaceOf(std::max(number, contents.oldest))];
    return contents;
}

std::size_t BlackBox::FetchBytes(bd::UInt64 number, std::size_t offset, bd::UInt8* bytes,
                                 std::size_t size) const
{
    const bd::Guard<bd::ThreadMutex> guard(m_Mutex);
    if (number < Oldest()) {
        return 0;
    }
    std::copy_n(m_Blocks.data() + PlaceOf(number) * m_BytesOfBlock + offset, size, bytes);
    return size;
}

bd::UInt64 BlackBox::Oldest() const
{
    return m_Received - std::min<bd::UInt64>(m_Received, m_Records.size());
}

// Counted backwards from the next place: a division of 64-bit numbers is slow on 32-bit processors.
std::size_t BlackBox::PlaceOf(bd::UInt64 number) const
{
    const auto age = static_cast<std::size_t>(m_Received - number);
    return m_Next >= age ? m_Next - age : m_Next + m_Records.size() - age;
}

} // namespace bdmv

/**
 * @file
 * The lines that wait for a destination.
 */
#ifndef KEVRO_LOGQUEUE_H
#define KEVRO_LOGQUEUE_H

#include <cstddef>
#include <memory>
#include <vector>

#include "logline.h"

namespace kevro
{

/** A line whose text is its own. */
struct QueuedLine {
    LineHead head;
    TextBuffer text;
};

/**
 * A bounded queue of lines that keeps the newest. All its memory is allocated at the start, except
 * for lines that need more than a TextBuffer has on the stack.
 *
 * Not thread-safe: its owner's mutex guards it.
 */
class LogQueue
{
public:
    /** @param lines lines that may wait; at least 1 */
    explicit LogQueue(std::size_t lines) : m_Places(lines + 1)
    {
        for (auto& pPlace : m_Places) {
            pPlace = std::make_unique<QueuedLine>();
        }
    }

    /** The number of lines that wait. */
    std::size_t Size() const { return m_Size; }

    /** Whether more than half of the lines wait that may. */
    bool IsHalfFull() const { return m_Size * 2 >= m_Places.size(); }

    /** The place to compose the next line in, which becomes part of the queue by Append(). */
    QueuedLine& Next()
    {
        QueuedLine& next = *m_Places[(m_Oldest + m_Size) % m_Places.size()];
        next.text.clear();
        return next;
    }

    /** Appends Next(). Returns whether the oldest line was dropped, because all places were taken.
     */
    bool Append()
    {
        if (++m_Size < m_Places.size()) {
            return false;
        }
        RemoveOldest();
        return true;
    }

    /** Exchanges the oldest line for one that is no longer needed. */
    void Take(std::unique_ptr<QueuedLine>& pLine)
    {
        m_Places[m_Oldest].swap(pLine);
        RemoveOldest();
    }

private:
    void RemoveOldest()
    {
        m_Oldest = (m_Oldest + 1) % m_Places.size();
        --m_Size;
    }

    std::vector<std::unique_ptr<QueuedLine>> m_Places; ///< one more than lines may wait: Next()
    std::size_t m_Oldest = 0;
    std::size_t m_Size = 0;
};

} // namespace kevro

#endif

/**
 * @file
 * The user operation mask.
 *
 * A disc forbids user operations through 64-bit masks in its play lists, play items and menu pages:
 * a set bit forbids one operation. bd::UserOperationMaskDef numbers the operations by the position
 * of their bit in the disc's field, counted from its first, most significant bit.
 *
 * @code
 * bdmv::UOMaskTable mask;
 * mask.Init(fieldOfThePlayList);
 * mask |= maskOfThePlayItem;
 * if (mask.IsSet(bd::UserOperationChapterSearch)) { ... refuse ... }
 * @endcode
 */
#ifndef DATABASE_UOMASKTABLE_H
#define DATABASE_UOMASKTABLE_H

#include "bd/types.h"

/**
 * Debug override of every reported mask, defined by the platform: 1 reports every operation as
 * permitted, 2 every operation as forbidden, anything else the mask as it is. Read at every call,
 * without a lock; a change takes effect at the next call.
 */
extern int g_u1Bduopmask;

namespace bdmv
{

/** A set of forbidden user operations. A plain value. */
class UOMaskTable
{
public:
    static const int UO_MASK_TABLE_SIZE = 8; ///< bytes of the mask field on the disc

    /** Nothing is forbidden. */
    UOMaskTable() : m_UOMaskTable(0) {}

    /** @param mask the disc's field as a number: the first operation is the most significant bit */
    explicit UOMaskTable(bd::UInt64 mask) : m_UOMaskTable(mask) {}

    ~UOMaskTable() = default;
    UOMaskTable(const UOMaskTable&) = default;
    UOMaskTable& operator=(const UOMaskTable&) = default;

    /** Forbids what either table forbids. */
    UOMaskTable& operator|=(const UOMaskTable& other)
    {
        m_UOMaskTable |= other.m_UOMaskTable;
        return *this;
    }

    /** Forbids only what both tables forbid. */
    UOMaskTable& operator&=(const UOMaskTable& other)
    {
        m_UOMaskTable &= other.m_UOMaskTable;
        return *this;
    }

    /** Compares the masks as stored; ignores ::g_u1Bduopmask. */
    bool operator==(const UOMaskTable& other) const { return m_UOMaskTable == other.m_UOMaskTable; }

    /**
     * The mask as it is reported: operation n is bit n, counted from the least significant.
     *
     * Honours ::g_u1Bduopmask.
     */
    bd::UInt64 GetUOMaskTable() const
    {
        bd::UInt64 reversed = 0;
        bd::UInt64 rest = m_UOMaskTable;
        for (int bit = 0; bit < 8 * UO_MASK_TABLE_SIZE; ++bit) {
            reversed = (reversed << 1) | (rest & 1);
            rest >>= 1;
        }
        switch (g_u1Bduopmask) {
        case 1:
            return 0;
        case 2:
            return ~bd::UInt64(0);
        default:
            return reversed;
        }
    }

    /**
     * Whether an operation is forbidden.
     *
     * Honours ::g_u1Bduopmask. False for a value outside 0 to 63.
     */
    bool IsSet(bd::UserOperationMaskDef operation) const;

    /**
     * Loads the mask field of a disc.
     *
     * @param field #UO_MASK_TABLE_SIZE bytes, the first operation in the top bit of the first byte;
     *              null is reported through Assert() and leaves nothing forbidden
     */
    void Init(const bd::UInt8* field);

private:
    bd::UInt64 m_UOMaskTable; ///< as on the disc, first byte most significant
};

static_assert(sizeof(UOMaskTable) == 8, "the mask and nothing else");

} // namespace bdmv

#endif

/**
 * @file
 * Marks of a play list.
 */
#ifndef DATABASE_IPLAYLISTMARK_H
#define DATABASE_IPLAYLISTMARK_H

#include "kevro/kevro_types.h"

namespace bdmv
{

/** A mark of a play list. */
class IPlayListMark
{
public:
    /** Kind of a mark, numbered as the disc's mark-type field. */
    enum MarkType : KEVRO_Int32 {
        MarkTypeEntryMark = 1, ///< a chapter starts here
        MarkTypeLinkPoint = 2  ///< a jump target of navigation programs
    };

    IPlayListMark() = default;
    virtual ~IPlayListMark() = default;
    IPlayListMark(const IPlayListMark&) = default;
    IPlayListMark& operator=(const IPlayListMark&) = default;
};

} // namespace bdmv

#endif

/**
 * @file
 * The navigation program of a button.
 */
#ifndef DATABASE_IPROGRAMDATA_H
#define DATABASE_IPROGRAMDATA_H

#include "bd/refptr.h"
#include "bd/types.h"
#include "database/inavigationcommanddata.h"

namespace bdmv
{

/** A navigation program: a sequence of navigation commands. Shared through RefPtr. */
class IProgramData
{
public:
    typedef bd::RefPtr<IProgramData> RefPtr; ///< shares a program
    typedef bd::UInt16 CommandIdDef;         ///< index of a command, from 0

    IProgramData() = default;
    virtual ~IProgramData() = default;
    IProgramData(const IProgramData&) = default;
    IProgramData& operator=(const IProgramData&) = default;

    /** The number of commands. */
    virtual bd::UInt16 GetNumberOfNavigationCommands() const = 0;

    /**
     * @param commandId index of the command
     * @return the command; owned by the program, valid during its lifetime
     */
    virtual const INavigationCommandData*
    GetNavigationCommandData(CommandIdDef commandId) const = 0;
};

} // namespace bdmv

#endif

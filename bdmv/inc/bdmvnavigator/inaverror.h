/**
 * @file
 * Error codes of the navigator.
 */
#ifndef BDMVNAVIGATOR_INAVERROR_H
#define BDMVNAVIGATOR_INAVERROR_H

#include "kevro/kevro_types.h"

namespace bdmv
{

/** Base of the navigator interfaces that report errors. */
class INavError
{
public:
    /** The result of an operation: ErrOk if it succeeded. */
    enum ErrCode : KEVRO_Int32 {
        ErrOk = 0,
        ErrOkRace = 1,
        ErrFailed = 2,
        ErrInvalidParam = 3,
        ErrInvalidState = 4,
        ErrIgFailed = 5,
        ErrOkIgnored = 6,
        ErrNotAllowed = 7
    };

    INavError() = default;
    virtual ~INavError() = default;
    INavError(const INavError&) = default;
    INavError& operator=(const INavError&) = default;
};

} // namespace bdmv

#endif

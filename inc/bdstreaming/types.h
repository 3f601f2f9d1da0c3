/**
 * @file
 * Types that the navigator shares with the streaming layer.
 */
#ifndef BDSTREAMING_TYPES_H
#define BDSTREAMING_TYPES_H

#include "kevro/kevro_types.h"

namespace bdstreaming
{

/**
 * Why the streaming layer finished. Listeners receive it as
 * bdmv::INavControlListener::FinishedReason, which has the same values in the same order.
 */
enum FinishedReason : KEVRO_Int32 {
    FinishedReasonEndOfMedia = 0,
    FinishedReasonDataStarvation = 1
};

} // namespace bdstreaming

#endif

/**
 * @file
 * Faults as text and JSON, one line each.
 */
#ifndef DESKPLAYER_CHECK_FAULTOUTPUT_H
#define DESKPLAYER_CHECK_FAULTOUTPUT_H

#include <ostream>

#include "check/fault.h"

namespace deskplayer
{

/** "BDMV/index.bdmv: offset 84: ..., but expected ...". */
void WriteFault(std::ostream& output, const Fault& fault);

/** {"file":"BDMV/index.bdmv","offset":84,"found":"...","expected":"..."} */
void WriteFaultAsJson(std::ostream& output, const Fault& fault);

} // namespace deskplayer

#endif

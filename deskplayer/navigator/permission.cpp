#include "navigator/permission.h"

#include <algorithm>
#include <string>

#include "database/uomasktable.h"
#include "text/names.h"

namespace deskplayer
{

namespace
{

/** The value of g_u1Bduopmask that reports every operation as forbidden. */
constexpr int MaskOverrideForbidsAll = 2;

} // namespace

const char* StatusName(Status status)
{
    switch (status) {
    case Status::Stopped:
        return "stopped";
    case Status::Playing:
        return "playing";
    case Status::Paused:
        return "paused";
    case Status::Still:
        return "in a still";
    case Status::Suspended:
        return "suspended";
    case Status::Standby:
        return "in standby";
    case Status::Finished:
        return "finished";
    }
    return "";
}

Outcome Permission::CheckMask(bd::UserOperationMaskDef operation) const
{
    if (m_rState.status == Status::Stopped || m_rState.status == Status::Standby ||
        m_rState.status == Status::Finished) {
        return Outcome::Done(); // no mask is in force
    }
    const LoadedPlayList& loaded = m_rPlayhead.LoadedList();
    const PlayItem* const item = m_rPlayhead.CurrentItem();
    const bool byPlayList =
        bdmv::UOMaskTable(loaded.playList.applicationInfo.uoMask).IsSet(operation);
    const bool byItem = item != nullptr && bdmv::UOMaskTable(item->uoMask).IsSet(operation);
    if (!byPlayList && !byItem) {
        return Outcome::Done();
    }
    if (g_u1Bduopmask == MaskOverrideForbidsAll) {
        return Outcome::Refused(NameOrNumber(operation) +
                                " is forbidden by the debug override KEVRO_UOPMASK=2");
    }
    const std::string list = "play list " + std::to_string(loaded.number);
    const std::string playItem = "play item " + std::to_string(m_rState.item);
    return Outcome::Refused(NameOrNumber(operation) + " is forbidden by " +
                            (!byItem       ? list
                             : !byPlayList ? playItem
                                           : list + " and its " + playItem));
}

Outcome Permission::CheckStatus(std::initializer_list<Status> statuses) const
{
    if (std::find(statuses.begin(), statuses.end(), m_rState.status) != statuses.end()) {
        return Outcome::Done();
    }
    std::string expected;
    for (const Status& status : statuses) {
        const char* const separator = &status + 1 == statuses.end() ? " or " : ", ";
        expected += (expected.empty() ? "" : separator) + std::string(StatusName(status));
    }
    return Outcome::Refused("not " + expected + ", but " + StatusName(m_rState.status));
}

Outcome Permission::CheckActive() const
{
    return CheckStatus({Status::Playing, Status::Paused, Status::Still});
}

} // namespace deskplayer

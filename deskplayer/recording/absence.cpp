#include "recording/absence.h"

#include <cstddef>

namespace deskplayer
{

namespace callbacks = bdmv::callbacks;

bool IsComplete(const CallbackRecord& record)
{
    return record.absent.none() && !record.knownBytes;
}

std::string AbsentArguments(const CallbackRecord& record)
{
    std::string names;
    std::size_t position = 0;
    record.callback.VisitArguments([&](const char* name, const auto& /*value*/) {
        const bool known = !record.absent[position] && !(position == 0 && record.knownBytes);
        if (!known) {
            names += (names.empty() ? "" : ", ") + std::string(name);
        }
        ++position;
    });
    return names;
}

void Fill(CallbackRecord& record)
{
    if (const auto* const suspended = record.callback.As<callbacks::SystemSuspended>()) {
        const bool hasBlock = suspended->data != nullptr && !record.absent[0];
        const bd::UInt32 known = hasBlock ? record.knownBytes.value_or(suspended->size) : 0;
        const void* const data = hasBlock ? suspended->data : nullptr;
        record.callback = callbacks::SystemSuspended{data, known};
    }
    record.absent.reset();
    record.knownBytes.reset();
}

} // namespace deskplayer

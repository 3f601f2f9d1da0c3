/**
 * @file
 * The listener that carries playback across a standby.
 */
#ifndef DESKPLAYER_NAVIGATOR_RESUMEDATAKEEPER_H
#define DESKPLAYER_NAVIGATOR_RESUMEDATAKEEPER_H

#include <vector>

#include "bdmvnavigator/navigatorlisteneradapter.h"

namespace deskplayer
{

/** Keeps a copy of the resume data: the context discards its own once the listeners have returned.
 */
class ResumeDataKeeper : public bdmv::NavigatorListenerAdapter
{
public:
    /** What the last SystemSuspended() brought; empty before. */
    const std::vector<bd::UInt8>& ResumeData() const { return m_ResumeData; }

    void SystemSuspended(const void* data, bd::UInt32 size) override
    {
        const auto* const bytes = static_cast<const bd::UInt8*>(data);
        m_ResumeData.assign(bytes, bytes + size);
    }

private:
    std::vector<bd::UInt8> m_ResumeData;
};

} // namespace deskplayer

#endif

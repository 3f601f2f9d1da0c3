/**
 * @file
 * The listener that stores resume data during a standby.
 */
#ifndef DESKPLAYER_NAVIGATOR_RESUMEDATAKEEPER_H
#define DESKPLAYER_NAVIGATOR_RESUMEDATAKEEPER_H

#include <vector>

#include "bdmvnavigator/navigatorlisteneradapter.h"

namespace deskplayer
{

/** Stores a copy of the resume data, which is valid only during the callback. */
class ResumeDataKeeper : public bdmv::NavigatorListenerAdapter
{
public:
    /** The data of the last SystemSuspended(); empty before the first. */
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

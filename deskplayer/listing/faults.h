/**
 * @file
 * What a listing could not read.
 */
#ifndef DESKPLAYER_LISTING_FAULTS_H
#define DESKPLAYER_LISTING_FAULTS_H

#include <cstddef>
#include <string>

#include "disc/aspectratios.h"
#include "disc/errors.h"

namespace deskplayer
{

/** Counts the faults of a disc and passes each on as one line. */
class Faults
{
public:
    /** @param handler may be empty; must outlive it */
    explicit Faults(const MessageHandler& handler) : m_rHandler(handler) {}

    void Add(const std::string& message)
    {
        ++m_Count;
        if (m_rHandler) {
            m_rHandler(message);
        }
    }

    /** Make AspectRatios report clip information that is missing or cannot be read. */
    ClipInfoHandlers OfClips()
    {
        const MessageHandler add = [this](const std::string& message) { Add(message); };
        return {add, add};
    }

    std::size_t Count() const { return m_Count; }

private:
    const MessageHandler& m_rHandler;
    std::size_t m_Count = 0;
};

} // namespace deskplayer

#endif

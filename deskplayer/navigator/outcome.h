/**
 * @file
 * What became of a user operation.
 */
#ifndef DESKPLAYER_NAVIGATOR_OUTCOME_H
#define DESKPLAYER_NAVIGATOR_OUTCOME_H

#include <cstdint>
#include <string>
#include <utility>

namespace deskplayer
{

/** Carried out, or refused: then no event was sent and nothing has changed. */
class Outcome
{
public:
    static Outcome Done() { return Outcome(std::string()); }

    /** @param reason why, as a sentence without a full stop; not empty */
    static Outcome Refused(std::string reason) { return Outcome(std::move(reason)); }

    /**
     * Refused for a number that does not exist, of a stream, a chapter or a button.
     *
     * @param what  a word for the thing that is numbered, from 1
     * @param count the greatest number; 0 if there is nothing
     */
    static Outcome NoSuch(const std::string& what, std::uint64_t number, std::uint64_t count)
    {
        return Refused("there is no " + what + " " + std::to_string(number) +
                       (count == 0 ? ", there is none here"
                                   : ", they count from 1 to " + std::to_string(count)));
    }

    bool IsDone() const { return m_Reason.empty(); }

    /** Why the operation was refused; empty when it was carried out. */
    const std::string& Reason() const { return m_Reason; }

private:
    explicit Outcome(std::string reason) : m_Reason(std::move(reason)) {}

    std::string m_Reason;
};

} // namespace deskplayer

#endif

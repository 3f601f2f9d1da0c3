/**
 * @file
 * The result of a user operation.
 */
#ifndef DESKPLAYER_NAVIGATOR_OUTCOME_H
#define DESKPLAYER_NAVIGATOR_OUTCOME_H

#include <cstdint>
#include <string>
#include <utility>

namespace deskplayer
{

/** Carried out or refused. A refused operation sends no event and changes nothing. */
class Outcome
{
public:
    static Outcome Done() { return Outcome(std::string()); }

    /** @param reason a sentence without a full stop; not empty */
    static Outcome Refused(std::string reason) { return Outcome(std::move(reason)); }

    /**
     * Refused because no stream, chapter or button has this number.
     *
     * @param what  the noun for what is numbered, in the singular: "button"
     * @param count the highest number; 0 if there are none
     */
    static Outcome NoSuch(const std::string& what, std::uint64_t number, std::uint64_t count)
    {
        const std::string valid = count == 0 ? "there are no " + what + "s"
                                  : count == 1
                                      ? "the only " + what + " is 1"
                                      : what + "s are numbered 1 to " + std::to_string(count);
        return Refused("no " + what + " " + std::to_string(number) + "; " + valid);
    }

    bool IsDone() const { return m_Reason.empty(); }

    /** Why the operation was refused; empty if it was carried out. */
    const std::string& Reason() const { return m_Reason; }

private:
    explicit Outcome(std::string reason) : m_Reason(std::move(reason)) {}

    std::string m_Reason;
};

} // namespace deskplayer

#endif

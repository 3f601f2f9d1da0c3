/**
 * @file
 * Ends the program in good order when a user interrupts it.
 *
 * @code
 * Interruption interruption;
 * while (!interruption.IsRequested() && WorkIsLeft()) {
 *     ...
 * }
 * RemoveWhatIsIncomplete();
 * interruption.EndIfRequested();
 * @endcode
 */
#ifndef DESKPLAYER_PROGRAM_INTERRUPTION_H
#define DESKPLAYER_PROGRAM_INTERRUPTION_H

namespace deskplayer
{

/**
 * While it exists, the first signal that asks the program to end is noted; the second one ends it.
 * Signals that are ignored stay ignored. Only one may exist at a time.
 */
class Interruption
{
public:
    Interruption();
    ~Interruption();

    Interruption(const Interruption&) = delete;
    Interruption& operator=(const Interruption&) = delete;

    /** Any thread may call this. */
    bool IsRequested() const;

    /** Ends the program as the signal would have, if there was one. */
    void EndIfRequested() const;
};

} // namespace deskplayer

#endif

/**
 * @file
 * A scoped lock.
 */
#ifndef BD_GUARD_H
#define BD_GUARD_H

namespace bd
{

/**
 * Holds a lock from its construction to its destruction, however the scope is left.
 *
 * The lock must outlive the guard. A guard belongs to the thread that made it.
 *
 * @tparam LockType has Acquire() const and Release() const, such as ThreadMutex; Release() does not
 *         throw
 */
template <typename LockType> class Guard
{
public:
    /** Acquires @p lock, waiting until it is free. Throws what Acquire() of the lock throws. */
    explicit Guard(const LockType& lock) : m_rLock(lock), m_Acquired(true) { lock.Acquire(); }

    ~Guard() { Release(); }

    Guard() = delete;
    Guard(const Guard&) = delete;
    Guard& operator=(const Guard&) = delete;

    /** Takes the lock again after Release(). If that throws, the guard is unchanged. */
    void Acquire()
    {
        m_rLock.Acquire();
        m_Acquired = true;
    }

    /** Releases the lock early; does nothing when the guard does not hold it. */
    void Release()
    {
        if (m_Acquired) {
            m_rLock.Release();
            m_Acquired = false;
        }
    }

private:
    const LockType& m_rLock;
    bool m_Acquired;
};

} // namespace bd

#endif

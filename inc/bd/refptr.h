/**
 * @file
 * A shared-ownership pointer whose counter is allocated apart from the object.
 *
 * @code
 * bd::RefPtr<bdmv::IProgramData> program(CreateProgram()); // takes ownership
 * bd::RefPtr<bdmv::IProgramData> kept = program;            // shares it
 * program.Release();                                        // kept still owns it
 * @endcode
 *
 * Lifetime. The last RefPtr to release the object deletes it, through its virtual destructor, and
 * then the counter. Give a raw pointer to one RefPtr only; copy that one from then on.
 *
 * Re-entrancy. The destructor of an object may release, assign or read the very RefPtr that is
 * releasing it. It must not copy or move from that RefPtr, and it must not throw.
 *
 * Threads. RefPtr objects that share an object may be copied and released on different threads at
 * once. One RefPtr object is not safe for concurrent use.
 *
 * Cost. A copy is one atomic addition. Only taking over a raw pointer allocates.
 */
#ifndef BD_REFPTR_H
#define BD_REFPTR_H

#include <memory>
#include <type_traits>
#include <utility>

#include "kevro/kevro_osa.h"
#include "kevro/kevro_types.h"

namespace bd
{

/**
 * Shares an object, or is empty.
 *
 * @tparam T has a virtual destructor that does not throw
 */
template <typename T> class RefPtr
{
public:
    /** Empty. */
    RefPtr() : m_RawPtr(nullptr), m_Counter(nullptr) {}

    /**
     * Takes ownership of @p p; empty for null.
     *
     * @throw std::bad_alloc no memory for the counter; @p p has been deleted
     */
    RefPtr(T* p) // NOLINT(google-explicit-constructor): factories return raw pointers
        : m_RawPtr(nullptr), m_Counter(nullptr)
    {
        if (p != nullptr) {
            std::unique_ptr<T> owned(p);
            m_Counter = new M_Counter(1);
            m_RawPtr = owned.release();
        }
    }

    /** Shares the object of @p other. */
    RefPtr(const RefPtr& other) : m_RawPtr(other.m_RawPtr), m_Counter(nullptr)
    {
        Acquire(other.m_Counter);
    }

    /** Takes over the object of @p other and leaves @p other empty; the count stays the same. */
    RefPtr(RefPtr&& other) noexcept : m_RawPtr(other.m_RawPtr), m_Counter(other.m_Counter)
    {
        other.m_RawPtr = nullptr;
        other.m_Counter = nullptr;
    }

    ~RefPtr() { Release(); }

    /**
     * Releases the current object, then shares that of @p other. Changes nothing when both share
     * the same object already. @p other may lie within the released object.
     */
    // NOLINTNEXTLINE(bugprone-unhandled-self-assignment): comparing counters handles it
    RefPtr& operator=(const RefPtr& other)
    {
        if (m_Counter != other.m_Counter) {
            RefPtr keep(other);
            Replace(keep);
        }
        return *this;
    }

    /**
     * Releases the current object, then takes over that of @p other and leaves @p other empty.
     * Changes nothing when both are the same RefPtr. @p other may lie within the released object.
     */
    RefPtr& operator=(RefPtr&& other) noexcept
    {
        if (this != &other) {
            RefPtr keep(std::move(other));
            Replace(keep);
        }
        return *this;
    }

    /**
     * Releases the current object, then takes ownership of @p p. Changes nothing when @p p is the
     * current object.
     *
     * @throw std::bad_alloc no memory for the counter; @p p has been deleted, and the current
     *        object is kept
     */
    RefPtr& operator=(T* p)
    {
        if (m_RawPtr != p) {
            RefPtr keep(p);
            Replace(keep);
        }
        return *this;
    }

    /** The object; not on an empty RefPtr. */
    T* operator->() const { return m_RawPtr; }

    /** The object; not on an empty RefPtr. */
    T& operator*() const { return *m_RawPtr; }

    /** Whether there is an object. */
    explicit operator bool() const { return m_RawPtr != nullptr; }

    /** The object, or null. Still owned by the RefPtr. */
    T* Get() const { return m_RawPtr; }

    /** Whether this is the only RefPtr that shares the object; false when empty. */
    bool IsUnique() const { return GetCount() == 1; }

    /** Whether there is no object. */
    bool Null() const { return m_RawPtr == nullptr; }

    /** Whether there is an object. */
    bool IsValid() const { return !Null(); }

    /** How many RefPtr objects share the object; 0 when empty. Other threads may change it. */
    KEVRO_Int32 GetCount() const
    {
        return m_Counter == nullptr ? 0 : KEVRO_Osa_TaskAtomicAdd(&m_Counter->m_Count, 0);
    }

    /** Releases the object; empty afterwards. Does nothing when empty. */
    void Release()
    {
        static_assert(std::has_virtual_destructor<T>::value,
                      "the last owner deletes the object through T*");
        M_Counter* const counter = m_Counter;
        if (counter != nullptr && KEVRO_Osa_TaskAtomicAdd(&counter->m_Count, -1) == 0) {
            delete m_RawPtr;
            const bool replaced = m_Counter != counter;
            delete counter;
            if (replaced) {
                // The object's destructor put another object into this RefPtr: release that, too.
                Release();
            }
        }
        m_Counter = nullptr;
        m_RawPtr = nullptr;
    }

private:
    struct M_Counter {
        explicit M_Counter(long count) : m_Count(static_cast<KEVRO_Int32>(count)) {}

        KEVRO_Int32 m_Count; ///< RefPtr objects that share the object; changed by the platform only
    };

    /** Shares @p counter and adds one to its count; has no counter for null. */
    void Acquire(M_Counter* counter)
    {
        m_Counter = counter;
        if (counter != nullptr) {
            KEVRO_Osa_TaskAtomicAdd(&counter->m_Count, 1);
        }
    }

    /** Releases, then takes over from @p keep, which owns its share before anything is deleted. */
    void Replace(RefPtr& keep)
    {
        Release();
        std::swap(m_RawPtr, keep.m_RawPtr);
        std::swap(m_Counter, keep.m_Counter);
    }

    T* m_RawPtr;
    M_Counter* m_Counter; ///< null if and only if empty
};

} // namespace bd

#endif
